#include "testmain.h"

#include <cstdio>
#include <map>
#include <string>
#include <string_view>

namespace {

std::map<std::string, TestProgram::Main, std::less<>> &programs() {
    static std::map<std::string, TestProgram::Main, std::less<>> all;
    return all;
}

std::string_view stem(std::string_view file) {
    file.remove_prefix(file.find_last_of("/\\") + 1);
    return file.substr(0, file.find_last_of('.'));
}

} // namespace

TestProgram::TestProgram(const char *sourceFile, Main main) {
    programs().emplace(stem(sourceFile), main);
}

int main(int argc, char *argv[]) {
    const auto program = argc > 1 ? programs().find(std::string_view(argv[1])) : programs().end();
    if (program == programs().end()) {
        std::fputs("The first argument names one of these tests:\n", stderr);
        for (const auto &[name, main] : programs())
            std::fprintf(stderr, "  %s\n", name.c_str());
        return 2;
    }
    argv[1] = argv[0];
    return program->second(argc - 1, argv + 1);
}
