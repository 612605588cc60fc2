#pragma once

/// What the process as a whole needs from the operating system.
namespace ProcessSetup {

/// A write to a connection that the peer has closed fails instead of ending the process.
void ignoreBrokenPipes();

/// The process leaves no image of its memory when it crashes, and no other program of the user reads it:
/// passwords stand there.
void keepMemoryPrivate();

} // namespace ProcessSetup
