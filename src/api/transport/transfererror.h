#pragma once

#include "api/transport/transfer.h"

#include <stdexcept>
#include <string>

/// Ends a transfer from inside: a file that is not what it has to be.
class TransferError : public std::runtime_error {
public:
    TransferError(TransferFailure failure, const char *reason, std::string file = {})
        : std::runtime_error(reason), m_failure(failure), m_file(std::move(file)) {}

    TransferFailure failure() const { return m_failure; }
    /// The file's name, for people.
    const std::string &file() const { return m_file; }

private:
    TransferFailure m_failure;
    std::string m_file;
};
