#pragma once

#include <string>

namespace emulator {

struct Answer;
struct Fault;

/// The body of an answer as a fault that changes bodies makes it; unchanged for the other kinds.
std::string spoiledBody(Answer answer, const Fault &fault);

} // namespace emulator
