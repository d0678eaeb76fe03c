# The stand-ins installed as the host installs its libraries (see install.cmake).
include(CMakePackageConfigHelpers)

# platform_package(<name> <package> <folder>): installs the library <name> for the simulator (its
# shared library) and, in the optional component "platform", as the CMake package <package> with
# the imported target <package>::<package> and the headers of <folder>, as a host installs its own
# libraries. Its dependencies are found as the packages they were installed as.
function(platform_package name package folder)
    set_target_properties(${name} PROPERTIES EXPORT_NAME ${package} HMIPHONE_PACKAGE ${package})
    set(dependencies "")
    get_target_property(links ${name} LINK_LIBRARIES)
    foreach(link ${links})
        if(link MATCHES "^Qt5::(.*)")
            string(APPEND dependencies "find_dependency(Qt5 5.15 COMPONENTS ${CMAKE_MATCH_1})\n")
        else()
            get_target_property(dependency ${link} HMIPHONE_PACKAGE)
            string(APPEND dependencies "find_dependency(${dependency} ${PROJECT_VERSION})\n")
        endif()
    endforeach()
    install(TARGETS ${name} EXPORT ${package}Targets
            LIBRARY DESTINATION "${HMIPHONE_INSTALL_PLATFORMDIR}" COMPONENT simulator NAMELINK_SKIP)
    install(DIRECTORY "${PROJECT_SOURCE_DIR}/platform/${folder}/"
            DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}/hmiphone-platform/${folder}"
            COMPONENT platform EXCLUDE_FROM_ALL FILES_MATCHING PATTERN "*.h" PATTERN "*_p.h" EXCLUDE)
    set(destination "${CMAKE_INSTALL_LIBDIR}/cmake/${package}")
    install(EXPORT ${package}Targets NAMESPACE ${package}:: DESTINATION "${destination}"
            COMPONENT platform EXCLUDE_FROM_ALL)
    set(PLATFORM_PACKAGE ${package})
    set(PLATFORM_DEPENDENCIES "${dependencies}")
    configure_package_config_file("${PROJECT_SOURCE_DIR}/cmake/PlatformConfig.cmake.in"
                                  "${PROJECT_BINARY_DIR}/platform/${package}Config.cmake"
                                  INSTALL_DESTINATION "${destination}")
    write_basic_package_version_file("${PROJECT_BINARY_DIR}/platform/${package}ConfigVersion.cmake"
                                     COMPATIBILITY SameMajorVersion)
    install(FILES "${PROJECT_BINARY_DIR}/platform/${package}Config.cmake"
                  "${PROJECT_BINARY_DIR}/platform/${package}ConfigVersion.cmake"
            DESTINATION "${destination}" COMPONENT platform EXCLUDE_FROM_ALL)
endfunction()

# In the order they depend on each other.
platform_package(journal HmiJournal journal)
platform_package(quorvel Quorvel quorvel)
platform_package(brisken Brisken brisken)
platform_package(taldris Taldris taldris)
platform_package(mavrosk Mavrosk mavrosk)
platform_package(modulehost HmiModuleHost host)
