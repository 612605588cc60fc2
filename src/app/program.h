#pragma once

#include <functional>

class QWidget;

/// The whole program, from the single-instance lock to the end of the event loop.
namespace Program {

/// Runs it and returns the process's exit status. shown is called once, when the frame was told to show
/// itself and nothing is painted yet.
int run(int argc, char *argv[], const std::function<void(QWidget &frame)> &shown = {});

} // namespace Program
