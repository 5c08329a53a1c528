# Compiles Edje sources with dependency tracking.

find_program(EDJE_CC edje_cc REQUIRED)

# edje_theme(TARGET ROOT OUTPUT): compiles ROOT into the absolute path OUTPUT as part of TARGET.
function(edje_theme target root output)
    set(depfile "${CMAKE_CURRENT_BINARY_DIR}/${target}.d")
    cmake_path(GET output PARENT_PATH folder)
    # The compiler's dependency file leaves out images.
    file(GLOB images CONFIGURE_DEPENDS "${CMAKE_SOURCE_DIR}/host/theme/images/*.png" "${CMAKE_SOURCE_DIR}/edje/images/*.png")
    add_custom_command(
        OUTPUT "${output}"
        COMMAND "${CMAKE_COMMAND}" -E make_directory "${folder}"
        COMMAND "${CMAKE_SOURCE_DIR}/scripts/edje-compile" "${EDJE_CC}" "${root}" "${output}" "${depfile}"
                -id "${CMAKE_SOURCE_DIR}/host/theme/images" -id "${CMAKE_SOURCE_DIR}/edje/images"
        DEPENDS "${root}" ${images} "${CMAKE_SOURCE_DIR}/scripts/edje-compile"
        DEPFILE "${depfile}"
        COMMENT "Compiling theme ${target}"
        VERBATIM)
    add_custom_target(${target} ALL DEPENDS "${output}")
endfunction()
