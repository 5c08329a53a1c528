# Compiles message catalogues.

find_program(MSGFMT msgfmt REQUIRED)

# gettext_catalogue(LANGUAGE): po/LANGUAGE.po becomes the catalogue of the text domain "clock".
function(gettext_catalogue language)
    set(source "${CMAKE_CURRENT_SOURCE_DIR}/${language}.po")
    set(output "${CLOCK_RESOURCE_DIR}/locale/${language}/LC_MESSAGES/clock.mo")
    cmake_path(GET output PARENT_PATH folder)
    add_custom_command(
        OUTPUT "${output}"
        COMMAND "${CMAKE_COMMAND}" -E make_directory "${folder}"
        COMMAND "${MSGFMT}" --check -o "${output}" "${source}"
        DEPENDS "${source}"
        COMMENT "Compiling catalogue ${language}"
        VERBATIM)
    add_custom_target(catalogue-${language} ALL DEPENDS "${output}")
endfunction()
