#include "app/program.h"
#include "platform/system/processsetup.h"

int main(int argc, char *argv[]) {
    return ProcessSetup::leave(Program::run(argc, argv));
}
