# Everything the project calls and did not write: packages of the distribution, never copies.

find_package(Qt6 6.4 REQUIRED COMPONENTS Core Gui Widgets Network LinguistTools)
if(UNIX AND NOT APPLE)
    find_package(Qt6 6.4 REQUIRED COMPONENTS DBus)
endif()
if(NVLDM_BUILD_TESTS OR NVLDM_BUILD_BENCH)
    find_package(Qt6 6.4 REQUIRED COMPONENTS Test)
endif()
find_package(OpenSSL 3 REQUIRED)
find_package(nlohmann_json 3.11 REQUIRED)
find_package(SQLite3 REQUIRED)
find_package(SQLiteCpp REQUIRED)
find_package(Threads REQUIRED)

# cpp-httplib is a compiled library here; its flags decide its layout, so they come from its own file.
find_package(PkgConfig REQUIRED)
pkg_check_modules(httplib REQUIRED IMPORTED_TARGET cpp-httplib)
pkg_check_modules(yamlcpp REQUIRED IMPORTED_TARGET yaml-cpp)
