#pragma once

#include <cstddef>

/// The ciphers that client and service share, as a C interface that any language can call.
///
/// Every operation returns 0 and hands back a newly allocated, zero-terminated text through its out pointer,
/// or returns 1 and sets the out pointer to null. The text is released with nvlcryptoFree, which wipes it
/// first. All operations may be called from any thread.
extern "C" {

/// Names the folder in which a file "nvlcrypto.key" (64 hex digits) replaces the built-in master key. Without
/// a call it is the folder of the client's store files. A key file that is there but malformed makes every
/// operation fail. Length 0 goes back to the default. Returns 0, or 1 for a null path.
int nvlcryptoSetKeyFolder(const char *path, std::size_t length);

/// Turns a secret (a password, a token) into "P1:" text. An empty secret fails.
int passToCipher(const char *secret, std::size_t length, char **cipher);
/// The inverse of passToCipher. Fails for any text that does not authenticate.
int cipherToPass(const char *cipher, std::size_t length, char **secret);

/// Turns a data block into "D1:" text.
int dataToCypher(const char *data, std::size_t length, char **cypher);
/// The inverse of dataToCypher. Fails for any text that does not authenticate.
int cypherToData(const char *cypher, std::size_t length, char **data);

/// A fresh "G1:" token, good for ten minutes of the service's clock.
int createGenericToken(char **token);

/// Wipes and releases a text that an operation handed out. Null is allowed.
void nvlcryptoFree(char *text);
}
