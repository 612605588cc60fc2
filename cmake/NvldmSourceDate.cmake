# The day of the sources: what the environment says, else that of the newest commit, else today. Programs that this
# run of CMake starts, and CMake's own clock, take it from the environment; so does CPack, which is told again.

if("$ENV{SOURCE_DATE_EPOCH}" STREQUAL "")
    execute_process(COMMAND git log -1 --format=%ct WORKING_DIRECTORY "${PROJECT_SOURCE_DIR}"
        OUTPUT_VARIABLE epoch OUTPUT_STRIP_TRAILING_WHITESPACE ERROR_QUIET RESULT_VARIABLE failed)
    if(failed)
        string(TIMESTAMP epoch %s UTC)
    endif()
    set(ENV{SOURCE_DATE_EPOCH} ${epoch})
endif()
set(NVLDM_SOURCE_DATE_EPOCH $ENV{SOURCE_DATE_EPOCH})
string(TIMESTAMP NVLDM_ISO_DAY "%Y-%m-%d" UTC)
string(TIMESTAMP NVLDM_MANUAL_DAY "%B %d, %Y" UTC)
string(TIMESTAMP NVLDM_CHANGELOG_TIME "%a, %d %b %Y %H:%M:%S +0000" UTC)
