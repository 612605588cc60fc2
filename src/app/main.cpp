#include "program.h"

#include <cstring>
#include <iostream>

int main(int argc, char *argv[]) {
    if (argc == 2 && std::strcmp(argv[1], "--version") == 0) {
        std::cout << "norvell-device-manager " NVLDM_VERSION "\n";
        return 0;
    }
    return Program::run(argc, argv);
}
