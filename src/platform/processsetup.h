#pragma once

/// What the process as a whole needs from the operating system.
namespace ProcessSetup {

/// A write to a connection that the peer has closed fails instead of ending the process.
void ignoreBrokenPipes();

} // namespace ProcessSetup
