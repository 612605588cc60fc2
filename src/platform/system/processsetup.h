#pragma once

/// What the process as a whole needs from the operating system.
namespace ProcessSetup {

/// Forgets the user's folders of the environment that are no absolute paths: they would be others wherever
/// the program is started. Before anything asks for a folder.
void dropRelativeFolders();

/// A write to a connection that the peer has closed fails instead of ending the process.
void ignoreBrokenPipes();

/// The process leaves no image of its memory when it crashes, and no other program of the user reads it:
/// passwords stand there.
void keepMemoryPrivate();

/// The last step of main(): gives its status back, or ends the process with it at once where libraries that
/// tidy up behind it may wait for threads that the system has ended already.
int leave(int status);

} // namespace ProcessSetup
