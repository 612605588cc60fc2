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

# A static library: the sources of its folders, which are named as they stand below src/. PUBLIC and PRIVATE name
# what it may include; the build fails where a file includes a folder of another library (CheckIncludes.cmake).
# A source whose name ends in _posix or _windows belongs to that system; EXCLUDE leaves names out; PRECOMPILED names
# the headers that are compiled once (NvldmPrecompiled).
#   nvldm_library(name FOLDERS … [EXCLUDE …] [PRECOMPILED kind] [PUBLIC …] [PRIVATE …])
function(nvldm_library name)
    cmake_parse_arguments(ARG "" "PRECOMPILED" "FOLDERS;EXCLUDE;PUBLIC;PRIVATE" ${ARGN})
    nvldm_find_sources(sources "${PROJECT_SOURCE_DIR}/src" FOLDERS ${ARG_FOLDERS} EXCLUDE ${ARG_EXCLUDE})
    add_library(${name} STATIC ${sources})
    target_include_directories(${name} PUBLIC "${PROJECT_SOURCE_DIR}/src")
    target_link_libraries(${name} PUBLIC ${ARG_PUBLIC} PRIVATE ${ARG_PRIVATE})
    nvldm_compile_options(${name})
    set_target_properties(${name} PROPERTIES
        NVLDM_FOLDERS "${ARG_FOLDERS}" NVLDM_LIBRARIES "${ARG_PUBLIC}")
    nvldm_check_includes(${name} SOURCES ${sources} FOLDERS ${ARG_FOLDERS} LIBRARIES ${ARG_PUBLIC} ${ARG_PRIVATE})
    if(ARG_PRECOMPILED)
        nvldm_precompile(${name} ${ARG_PRECOMPILED})
    endif()
endfunction()

# The sources of folders below a root; a new file is found at the next build.
function(nvldm_find_sources out root)
    cmake_parse_arguments(ARG "" "" "FOLDERS;EXCLUDE" ${ARGN})
    set(sources)
    foreach(folder IN LISTS ARG_FOLDERS)
        file(GLOB found CONFIGURE_DEPENDS
            "${root}/${folder}/*.cpp" "${root}/${folder}/*.h" "${root}/${folder}/*.ui")
        list(APPEND sources ${found})
    endforeach()
    if(WIN32)
        list(FILTER sources EXCLUDE REGEX "_posix\\.cpp$")
    else()
        list(FILTER sources EXCLUDE REGEX "_windows\\.cpp$")
    endif()
    foreach(name IN LISTS ARG_EXCLUDE)
        list(FILTER sources EXCLUDE REGEX "/${name}\\.[a-z]+$")
    endforeach()
    set(${out} ${sources} PARENT_SCOPE)
endfunction()

# Lets the build fail where one of the sources includes a folder of src/ that belongs to none of the libraries.
function(nvldm_check_includes target)
    cmake_parse_arguments(ARG "" "" "SOURCES;FOLDERS;LIBRARIES" ${ARGN})
    set(allowed ${ARG_FOLDERS})
    set(libraries ${ARG_LIBRARIES})
    while(libraries)
        list(POP_FRONT libraries library)
        if(TARGET ${library})
            get_target_property(folders ${library} NVLDM_FOLDERS)
            get_target_property(public ${library} NVLDM_LIBRARIES)
            if(folders)
                list(APPEND allowed ${folders})
            endif()
            if(public)
                list(APPEND libraries ${public})
            endif()
        endif()
    endwhile()
    list(REMOVE_DUPLICATES allowed)
    set(stamp "${PROJECT_BINARY_DIR}/includes/${target}.stamp")
    set(list "${PROJECT_BINARY_DIR}/includes/${target}.txt")
    file(CONFIGURE OUTPUT "${list}" CONTENT "${ARG_SOURCES}")
    add_custom_command(OUTPUT "${stamp}"
        COMMAND ${CMAKE_COMMAND} -DTARGET=${target} -DROOT=${PROJECT_SOURCE_DIR}/src "-DALLOWED=${allowed}"
            -DLIST=${list} -DSTAMP=${stamp} -P "${PROJECT_SOURCE_DIR}/cmake/CheckIncludes.cmake"
        DEPENDS ${ARG_SOURCES} "${list}" "${PROJECT_SOURCE_DIR}/cmake/CheckIncludes.cmake"
        COMMENT "Checking what ${target} includes"
        VERBATIM)
    target_sources(${target} PRIVATE "${stamp}")
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

# The Qt Test classes of a folder as one program, each registered with ctest under the name of its file; off screen.
# POSIX names those whose other side is written for POSIX systems, as the scripted peers are; others leave them out.
# EXCLUDE leaves files out. A new file is found at the next build.
# ON_DISPLAY names those about windows, which run on a virtual display under a window manager.
#   nvldm_tests(program PRECOMPILED kind [POSIX tst_… …] [ON_DISPLAY tst_… …] [EXCLUDE tst_… …] LIBS … [SOURCES …])
function(nvldm_tests program)
    cmake_parse_arguments(ARG "" "PRECOMPILED" "POSIX;ON_DISPLAY;EXCLUDE;LIBS;SOURCES" ${ARGN})
    file(GLOB sources CONFIGURE_DEPENDS tst_*.cpp)
    set(tests ${sources})
    list(TRANSFORM tests REPLACE "^.*/(tst_[^/]+)\\.cpp$" "\\1")
    list(REMOVE_ITEM tests "" ${ARG_EXCLUDE})
    if(NOT UNIX)
        list(REMOVE_ITEM tests "" ${ARG_POSIX} ${ARG_ON_DISPLAY})
    endif()
    list(TRANSFORM tests APPEND .cpp OUTPUT_VARIABLE sources)
    nvldm_test_program(${program} PRECOMPILED ${ARG_PRECOMPILED} LIBS ${ARG_LIBS} nvldm_test_main
        SOURCES ${sources} ${ARG_SOURCES})
    foreach(test IN LISTS tests)
        set(display)
        if(test IN_LIST ARG_ON_DISPLAY)
            set(display "${PROJECT_SOURCE_DIR}/scripts/on-display")
        endif()
        add_test(NAME ${test} COMMAND ${display} $<TARGET_FILE:${program}> ${test})
        nvldm_test_properties(${test})
    endforeach()
endfunction()

# A Qt Test program with a main function of its own: one that starts itself again as another process.
#   nvldm_own_test(tst_name [POSIX] PRECOMPILED kind LIBS … [SOURCES …])
function(nvldm_own_test name)
    cmake_parse_arguments(ARG "POSIX" "PRECOMPILED" "LIBS;SOURCES" ${ARGN})
    if(ARG_POSIX AND NOT UNIX)
        return()
    endif()
    nvldm_test_program(${name} PRECOMPILED ${ARG_PRECOMPILED} LIBS ${ARG_LIBS} SOURCES ${name}.cpp ${ARG_SOURCES})
    add_test(NAME ${name} COMMAND ${name})
    nvldm_test_properties(${name})
endfunction()

function(nvldm_test_program name)
    cmake_parse_arguments(ARG "" "PRECOMPILED" "LIBS;SOURCES" ${ARGN})
    add_executable(${name} ${ARG_SOURCES})
    target_include_directories(${name} PRIVATE "${PROJECT_SOURCE_DIR}/tests")
    target_link_libraries(${name} PRIVATE ${ARG_LIBS} Qt6::Test)
    nvldm_compile_options(${name})
    nvldm_qt_options(${name})
    nvldm_precompile(${name} ${ARG_PRECOMPILED})
endfunction()

function(nvldm_test_properties test)
    # Where another system is played, programs take long to start.
    set(timeout 120)
    if(CMAKE_CROSSCOMPILING)
        set(timeout 360)
    endif()
    set_tests_properties(${test} PROPERTIES
        TIMEOUT ${timeout}
        SKIP_RETURN_CODE 77
        ENVIRONMENT "QT_QPA_PLATFORM=offscreen;LC_ALL=C.UTF-8;NVLDM_EMULATOR=$<TARGET_FILE:nvldm-emulator>")
endfunction()
