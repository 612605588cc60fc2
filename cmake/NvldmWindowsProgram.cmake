# What a program of Windows carries beside its code: version, icon and manifest.
#   nvldm_windows_program(target "What it is")
function(nvldm_windows_program target description)
    enable_language(RC)
    set(manifest "${PROJECT_SOURCE_DIR}/packaging/windows/program.manifest")
    set(manifest_line "1 24 \"${manifest}\"")
    if(MSVC)
        # This linker puts manifests into programs itself, and two would be one too many.
        set(manifest_line "")
        target_sources(${target} PRIVATE "${manifest}")
    endif()
    string(REPLACE "." "," version_numbers "${PROJECT_VERSION}")
    set(script "${CMAKE_CURRENT_BINARY_DIR}/${target}.rc")
    configure_file("${PROJECT_SOURCE_DIR}/packaging/windows/program.rc.in" "${script}" @ONLY)
    target_sources(${target} PRIVATE "${script}")
    set_property(SOURCE "${script}" PROPERTY OBJECT_DEPENDS
        "${manifest};${PROJECT_SOURCE_DIR}/resources/images/app_icon.ico")
endfunction()
