// The client's own start up to its first frame.

#include "app/program.h"
#include "firstframe.h"

int main(int argc, char *argv[]) {
    return Program::run(argc, argv, [](QWidget &frame) { new FirstFrame(frame); });
}
