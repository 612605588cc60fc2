# Pictures for a toolkit that cannot read SVG: drawn by the build in several sizes, under the names of their sources,
# so that program and style sheets ask for the same ones everywhere.

find_program(RSVG_CONVERT rsvg-convert REQUIRED)

# nvldm_draw_pictures(target base list) — takes the SVG files out of the list and makes their drawings resources of the
# target; a size is named as the toolkit names pictures for denser screens.
function(nvldm_draw_pictures target base list)
    set(drawn "${CMAKE_CURRENT_BINARY_DIR}/drawn")
    set(kept ${${list}})
    list(FILTER kept EXCLUDE REGEX "\\.svg$")
    set(sources ${${list}})
    list(FILTER sources INCLUDE REGEX "\\.svg$")
    foreach(source IN LISTS sources)
        file(RELATIVE_PATH name "${base}" "${source}")
        string(REGEX REPLACE "\\.svg$" "" name "${drawn}/${name}")
        # The largest is for the few places that show a picture much larger than it was designed.
        set(made "${name}.svg" "${name}@1.5x.svg" "${name}@2x.svg" "${name}@6x.svg")
        cmake_path(GET name PARENT_PATH folder)
        add_custom_command(OUTPUT ${made}
            COMMAND ${CMAKE_COMMAND} -E make_directory "${folder}"
            COMMAND ${RSVG_CONVERT} --zoom 1 --output "${name}.svg" "${source}"
            COMMAND ${RSVG_CONVERT} --zoom 1.5 --output "${name}@1.5x.svg" "${source}"
            COMMAND ${RSVG_CONVERT} --zoom 2 --output "${name}@2x.svg" "${source}"
            COMMAND ${RSVG_CONVERT} --zoom 6 --output "${name}@6x.svg" "${source}"
            DEPENDS "${source}" VERBATIM)
        list(APPEND drawings ${made})
    endforeach()
    qt_add_resources(${target} "nvldm_drawings" PREFIX "/" BASE "${drawn}" OPTIONS --no-compress --format-version 1
        FILES ${drawings})
    set(${list} "${kept}" PARENT_SCOPE)
endfunction()
