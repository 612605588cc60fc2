#include "processsetup.h"
#include "program.h"

int main(int argc, char *argv[]) {
    return ProcessSetup::leave(Program::run(argc, argv));
}
