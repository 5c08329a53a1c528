# Compiles message catalogues.

find_program(MSGCAT msgcat REQUIRED)
find_program(MSGFMT msgfmt REQUIRED)

# gettext_catalogue(LANGUAGE OUTPUT SOURCE...): the sources become the catalogue of the text domain
# "clock"; where several have a text, the first one's counts. OUTPUT is set to the file's name.
function(gettext_catalogue language output)
    set(file "${CLOCK_RESOURCE_DIR}/locale/${language}/LC_MESSAGES/clock.mo")
    cmake_path(GET file PARENT_PATH folder)
    set(source ${ARGN})
    set(merge "")
    list(LENGTH source count)
    if(count GREATER 1)
        set(source "${CMAKE_CURRENT_BINARY_DIR}/${language}.po")
        set(merge COMMAND "${MSGCAT}" --use-first -o "${source}" ${ARGN})
    endif()
    # Built sources have no person and no date that a header could name.
    add_custom_command(
        OUTPUT "${file}"
        COMMAND "${CMAKE_COMMAND}" -E make_directory "${folder}"
        ${merge}
        COMMAND "${MSGFMT}" --check-format --check-domain -o "${file}" "${source}"
        DEPENDS ${ARGN} world-data
        COMMENT "Compiling catalogue ${language}"
        VERBATIM)
    set(${output} "${file}" PARENT_SCOPE)
endfunction()
