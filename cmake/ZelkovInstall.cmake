# Installed copy: libraries, headers, the CMake package and the pkg-config file.
include(CMakePackageConfigHelpers)

get_property(targets GLOBAL PROPERTY ZELKOV_INSTALLED_TARGETS)
install(TARGETS ${targets} EXPORT ZelkovWidgetsTargets
    RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR} COMPONENT runtime
    LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT runtime NAMELINK_COMPONENT dev
    ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT dev)

set(package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/ZelkovWidgets)
install(EXPORT ZelkovWidgetsTargets NAMESPACE Zelkov:: DESTINATION ${package_dir} COMPONENT dev)
configure_package_config_file(cmake/ZelkovWidgetsConfig.cmake.in
    ${PROJECT_BINARY_DIR}/ZelkovWidgetsConfig.cmake INSTALL_DESTINATION ${package_dir})
write_basic_package_version_file(${PROJECT_BINARY_DIR}/ZelkovWidgetsConfigVersion.cmake
    COMPATIBILITY SameMajorVersion)
install(FILES
    ${PROJECT_BINARY_DIR}/ZelkovWidgetsConfig.cmake
    ${PROJECT_BINARY_DIR}/ZelkovWidgetsConfigVersion.cmake
    DESTINATION ${package_dir} COMPONENT dev)

# pkg-config cannot see whether the archive or the shared object was built, so the file says it.
set(ZELKOV_PC_LIBS "-lZelkovWidgets")
set(ZELKOV_PC_CFLAGS "")
if(ZELKOV_PLATFORM STREQUAL "bundled")
    string(APPEND ZELKOV_PC_LIBS " -lZelkovUtils -lZelkovCoreQt -lZelkovCore")
endif()
if(NOT BUILD_SHARED_LIBS)
    string(APPEND ZELKOV_PC_LIBS " -Wl,-u,zelkov_resource_anchor")
    set(ZELKOV_PC_CFLAGS
        "-DZELKOV_WIDGETS_STATIC_DEFINE -DZELKOV_UTILS_STATIC_DEFINE -DZELKOV_COREQT_STATIC_DEFINE -DZELKOV_CORE_STATIC_DEFINE")
endif()
# Relative to the file itself, so that an installed copy may be moved or installed with another prefix.
file(RELATIVE_PATH ZELKOV_PC_TO_PREFIX "/${CMAKE_INSTALL_LIBDIR}/pkgconfig" "/")
string(REGEX REPLACE "/$" "" ZELKOV_PC_TO_PREFIX "${ZELKOV_PC_TO_PREFIX}")
configure_file(cmake/zelkovwidgets.pc.in ${PROJECT_BINARY_DIR}/zelkovwidgets.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/zelkovwidgets.pc
    DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig COMPONENT dev)
install(FILES src/resources/ZelkovJson_de.ts src/resources/ZelkovJson_fr.ts
    src/resources/ZelkovWidgets_de.ts src/resources/ZelkovWidgets_fr.ts
    DESTINATION ${CMAKE_INSTALL_DATADIR}/zelkov/translations COMPONENT dev)
