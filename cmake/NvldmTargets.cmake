# How a target of this project is built; every target goes through one of these functions.

function(nvldm_compile_options target)
    target_compile_features(${target} PUBLIC cxx_std_20)
    if(MSVC)
        target_compile_options(${target} PRIVATE /W4 /permissive- /utf-8 $<$<BOOL:${NVLDM_WERROR}>:/WX>)
    else()
        target_compile_options(${target} PRIVATE
            -Wall -Wextra -Wpedantic -Wshadow -Wnon-virtual-dtor -Woverloaded-virtual -Wold-style-cast -Wcast-qual
            $<$<BOOL:${NVLDM_WERROR}>:-Werror>)
        nvldm_release_options(${target})
    endif()
    if(WIN32)
        # The system's headers come with macros named min and max, and with an older socket interface.
        target_compile_definitions(${target} PRIVATE NOMINMAX WIN32_LEAN_AND_MEAN)
    endif()
endfunction()

# What is given to others names no folder of the machine that built it, so that the same sources make the same
# bytes anywhere; on Linux it carries the hardening that the distribution expects of its programs. The places in a
# crash's text are looked up in what packaging takes off the programs and keeps.
function(nvldm_release_options target)
    target_compile_options(${target} PRIVATE
        "$<$<CONFIG:Release>:-g1;-ffile-prefix-map=${PROJECT_SOURCE_DIR}/=;-ffile-prefix-map=${PROJECT_BINARY_DIR}/=>"
        # The folder that the compiler runs in, which has no slash behind it.
        "$<$<CONFIG:Release>:-fdebug-prefix-map=${PROJECT_BINARY_DIR}=.>")
    if(CMAKE_CXX_COMPILER_ID STREQUAL GNU AND CMAKE_CXX_COMPILER_VERSION VERSION_LESS 13)
        # Where it optimises most, this version sees texts overlap that are put together; none does.
        target_compile_options(${target} PRIVATE "$<$<CONFIG:Release>:-Wno-restrict>")
    endif()
    if(NOT WIN32)
        target_compile_options(${target} PRIVATE
            "$<$<CONFIG:Release>:-fstack-protector-strong;-Wp,-D_FORTIFY_SOURCE=2>")
        target_link_options(${target} PRIVATE "$<$<CONFIG:Release>:-Wl,-z,relro,-z,now>")
    endif()
endfunction()

# A static library of one folder. PUBLIC and PRIVATE name what it may include: a header of a library that is
# not linked here is not on the include path.
# PRECOMPILED names the headers that are compiled once (NvldmPrecompiled).
#   nvldm_library(name [PRECOMPILED kind] SOURCES … [PUBLIC …] [PRIVATE …])
function(nvldm_library name)
    cmake_parse_arguments(ARG "" "PRECOMPILED" "SOURCES;PUBLIC;PRIVATE" ${ARGN})
    add_library(${name} STATIC ${ARG_SOURCES})
    target_include_directories(${name} PUBLIC "${CMAKE_CURRENT_SOURCE_DIR}")
    target_link_libraries(${name} PUBLIC ${ARG_PUBLIC} PRIVATE ${ARG_PRIVATE})
    nvldm_compile_options(${name})
    if(ARG_PRECOMPILED)
        nvldm_precompile(${name} ${ARG_PRECOMPILED})
    endif()
endfunction()

# The same for a library of Qt code: moc and uic run, strings stay QString on purpose, and log lines carry
# their source line in release builds too.
function(nvldm_qt_library name)
    nvldm_library(${name} ${ARGN})
    nvldm_qt_options(${name})
endfunction()

function(nvldm_qt_options target)
    # Generated code names headers as sources do, not by the way from the build folder to them.
    set_target_properties(${target} PROPERTIES AUTOMOC ON AUTOMOC_PATH_PREFIX ON AUTOUIC ON)
    target_compile_definitions(${target} PRIVATE
        QT_MESSAGELOGCONTEXT QT_NO_CAST_TO_ASCII QT_NO_FOREACH QT_DISABLE_DEPRECATED_BEFORE=0x060400)
endfunction()

# A Qt Test program, registered with ctest under its own name, off screen. One whose other side is written for POSIX
# systems, as the scripted peers are, is left out on others. One that is about windows runs on a virtual display under a
# window manager.
#   nvldm_test(tst_name [POSIX] [ON_DISPLAY] [PRECOMPILED kind] LIBS … [SOURCES …] [TIMEOUT s])
function(nvldm_test name)
    cmake_parse_arguments(ARG "POSIX;ON_DISPLAY" "PRECOMPILED;TIMEOUT" "LIBS;SOURCES" ${ARGN})
    if(ARG_POSIX AND NOT UNIX)
        return()
    endif()
    add_executable(${name} ${name}.cpp ${ARG_SOURCES})
    target_link_libraries(${name} PRIVATE ${ARG_LIBS} Qt6::Test)
    nvldm_compile_options(${name})
    nvldm_qt_options(${name})
    if(ARG_PRECOMPILED)
        nvldm_precompile(${name} ${ARG_PRECOMPILED})
    endif()
    if(ARG_ON_DISPLAY)
        add_test(NAME ${name} COMMAND "${PROJECT_SOURCE_DIR}/scripts/on-display" $<TARGET_FILE:${name}>)
    else()
        add_test(NAME ${name} COMMAND ${name})
    endif()
    if(NOT ARG_TIMEOUT)
        set(ARG_TIMEOUT 120)
    endif()
    if(CMAKE_CROSSCOMPILING)
        # Where another system is played, programs take long to start.
        math(EXPR ARG_TIMEOUT "3 * ${ARG_TIMEOUT}")
    endif()
    set_tests_properties(${name} PROPERTIES
        TIMEOUT ${ARG_TIMEOUT}
        SKIP_RETURN_CODE 77
        ENVIRONMENT "QT_QPA_PLATFORM=offscreen;LC_ALL=C.UTF-8;NVLDM_EMULATOR=$<TARGET_FILE:nvldm-emulator>")
endfunction()
