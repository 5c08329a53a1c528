# What an application needs to use the library: headers, libraries, resources, and how to find them.

include(CMakePackageConfigHelpers)

set(CLOCK_UI_INCLUDE_DIR "${CMAKE_INSTALL_INCLUDEDIR}/clock-ui")
set(CLOCK_UI_CMAKE_DIR "${CMAKE_INSTALL_LIBDIR}/cmake/clock-ui")
set(CLOCK_UI_RESOURCE_DIR "${CMAKE_INSTALL_DATADIR}/clock-ui")

# While building, every library has the include folders of its own sources; installed, all headers
# share one folder.
foreach(library clock-ui app-assist clock-common device-host)
    get_target_property(folders ${library} INTERFACE_INCLUDE_DIRECTORIES)
    set_target_properties(${library} PROPERTIES
        INTERFACE_INCLUDE_DIRECTORIES
            "$<BUILD_INTERFACE:${folders}>;$<INSTALL_INTERFACE:${CLOCK_UI_INCLUDE_DIR}>"
        INSTALL_RPATH "$ORIGIN")
endforeach()

install(TARGETS clock-ui app-assist clock-common device-host device-api EXPORT clock-ui
    LIBRARY DESTINATION "${CMAKE_INSTALL_LIBDIR}")
install(EXPORT clock-ui NAMESPACE clock-ui:: FILE clock-ui-targets.cmake DESTINATION "${CLOCK_UI_CMAKE_DIR}")

install(DIRECTORY "${PROJECT_SOURCE_DIR}/include/" DESTINATION "${CLOCK_UI_INCLUDE_DIR}" FILES_MATCHING PATTERN "*.h")
foreach(folder app_assist clock device)
    install(DIRECTORY "${PROJECT_SOURCE_DIR}/platform/${folder}" DESTINATION "${CLOCK_UI_INCLUDE_DIR}"
        FILES_MATCHING PATTERN "*.h" PATTERN AlarmRing.h EXCLUDE
        PATTERN CityDatabase.h EXCLUDE PATTERN WDeferredDeletion.h EXCLUDE)
endforeach()
install(DIRECTORY "${PROJECT_SOURCE_DIR}/host/include/" DESTINATION "${CLOCK_UI_INCLUDE_DIR}" FILES_MATCHING PATTERN "*.h")
install(DIRECTORY "${CLOCK_RESOURCE_DIR}/" DESTINATION "${CLOCK_UI_RESOURCE_DIR}")

# The simulator, and the city picker, which is the same program under another name.
file(RELATIVE_PATH libraries_from_programs "/prefix/${CMAKE_INSTALL_BINDIR}" "/prefix/${CMAKE_INSTALL_LIBDIR}")
file(RELATIVE_PATH program_from_applications "/prefix/${CMAKE_INSTALL_LIBEXECDIR}/clock-ui" "/prefix/${CMAKE_INSTALL_BINDIR}/clock-sim")
set_target_properties(clock-sim PROPERTIES INSTALL_RPATH "$ORIGIN/${libraries_from_programs}")
install(TARGETS clock-sim RUNTIME DESTINATION "${CMAKE_INSTALL_BINDIR}")
set(city_picker "${PROJECT_BINARY_DIR}/package/com.vendra.clock.city-picker")
file(MAKE_DIRECTORY "${PROJECT_BINARY_DIR}/package")
file(CREATE_LINK "${program_from_applications}" "${city_picker}" SYMBOLIC)
install(FILES "${city_picker}" DESTINATION "${CMAKE_INSTALL_LIBEXECDIR}/clock-ui")
install(FILES "${PROJECT_SOURCE_DIR}/simulator/clock-sim.desktop" DESTINATION "${CMAKE_INSTALL_DATADIR}/applications")
install(FILES "${PROJECT_SOURCE_DIR}/simulator/clock-sim.svg" DESTINATION "${CMAKE_INSTALL_DATADIR}/icons/hicolor/scalable/apps")

configure_package_config_file("${PROJECT_SOURCE_DIR}/cmake/clock-ui-config.cmake.in"
    "${PROJECT_BINARY_DIR}/package/clock-ui-config.cmake"
    INSTALL_DESTINATION "${CLOCK_UI_CMAKE_DIR}" PATH_VARS CLOCK_UI_RESOURCE_DIR)
write_basic_package_version_file("${PROJECT_BINARY_DIR}/package/clock-ui-config-version.cmake"
    COMPATIBILITY SameMinorVersion)
install(FILES "${PROJECT_BINARY_DIR}/package/clock-ui-config.cmake"
    "${PROJECT_BINARY_DIR}/package/clock-ui-config-version.cmake" DESTINATION "${CLOCK_UI_CMAKE_DIR}")

file(RELATIVE_PATH CLOCK_UI_PREFIX_FROM_PC "/prefix/${CMAKE_INSTALL_LIBDIR}/pkgconfig" "/prefix")
configure_file("${PROJECT_SOURCE_DIR}/cmake/clock-ui.pc.in" "${PROJECT_BINARY_DIR}/package/clock-ui.pc" @ONLY)
install(FILES "${PROJECT_BINARY_DIR}/package/clock-ui.pc" DESTINATION "${CMAKE_INSTALL_LIBDIR}/pkgconfig")
