# What makes builds quick and does not change what they make: a compiler cache and a quick linker, where they are
# installed. Neither is needed, and what is given to others (Release) is linked as always.
find_program(CCACHE_PROGRAM ccache)
if(CCACHE_PROGRAM AND NOT CMAKE_CXX_COMPILER_LAUNCHER)
    # Precompiled headers want these. Paths are compared as they are: a release maps them to where they stand in the
    # project, which a rewritten path would miss.
    set(CMAKE_CXX_COMPILER_LAUNCHER ${CMAKE_COMMAND} -E env CCACHE_DEPEND=1
        CCACHE_SLOPPINESS=pch_defines,time_macros,include_file_mtime,include_file_ctime ${CCACHE_PROGRAM})
endif()

if(UNIX AND NOT APPLE)
    include(CheckLinkerFlag)
    check_linker_flag(CXX -fuse-ld=lld NVLDM_HAS_LLD)
    if(NVLDM_HAS_LLD)
        add_link_options($<$<NOT:$<CONFIG:Release>>:-fuse-ld=lld>)
    endif()
endif()
