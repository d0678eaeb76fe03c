# What `cmake --install` puts under the prefix, in three components:
#   module     the plug-in where a host loads module plug-ins (lib/<multiarch>/hmi/modules), the
#              CMake package HmiPhone, the README, the changelog and the licence;
#   simulator  hmiphone-sim, the stand-ins' shared libraries it runs on and the example scenarios;
#   platform   (only when asked for: --component platform) the stand-ins' headers and CMake
#              packages, for building a module against them.
# Binaries find the project's libraries relative to themselves ($ORIGIN run paths), so an
# installed tree still runs after it is moved.
include(CMakePackageConfigHelpers)

set(HMIPHONE_MAINTAINER "The hmiphone authors <hmiphone@example.org>")

set(HMIPHONE_INSTALL_CMAKEDIR "${CMAKE_INSTALL_LIBDIR}/cmake/HmiPhone")
set(HMIPHONE_INSTALL_DOCDIR "${CMAKE_INSTALL_DATAROOTDIR}/doc/hmiphone")
set(HMIPHONE_INSTALL_SIM_DOCDIR "${CMAKE_INSTALL_DATAROOTDIR}/doc/hmiphone-sim")

# hmiphone_origin_path(<variable> <from> <to>): the run path "$ORIGIN/..." from the folder <from>
# to the folder <to>, both under the prefix.
function(hmiphone_origin_path variable from to)
    file(RELATIVE_PATH path "/${from}" "/${to}")
    if(path STREQUAL "")
        set(${variable} "$ORIGIN" PARENT_SCOPE)
    else()
        set(${variable} "$ORIGIN/${path}" PARENT_SCOPE)
    endif()
endfunction()

if(TARGET journal)
    include("${CMAKE_CURRENT_LIST_DIR}/platformpackages.cmake")
endif()

# The plug-in, exported as HmiPhone::plugin (a module library: a host deploys and loads it).
install(TARGETS hmiphone EXPORT HmiPhonePluginTargets
        LIBRARY DESTINATION "${HMIPHONE_INSTALL_PLUGINDIR}" COMPONENT module)
set_target_properties(hmiphone PROPERTIES EXPORT_NAME plugin)
if(TARGET journal)
    # On the stand-ins, wherever it is loaded from (a host's own libraries lie on its search path).
    hmiphone_origin_path(rpath "${HMIPHONE_INSTALL_PLUGINDIR}" "${HMIPHONE_INSTALL_PLATFORMDIR}")
    set_target_properties(hmiphone PROPERTIES INSTALL_RPATH "${rpath}")
endif()
install(EXPORT HmiPhonePluginTargets NAMESPACE HmiPhone:: DESTINATION "${HMIPHONE_INSTALL_CMAKEDIR}"
        COMPONENT module)

# The simulator, exported as HmiPhone::hmiphone-sim; installed, it loads the installed plug-in.
if(TARGET hmiphone-sim)
    install(TARGETS hmiphone-sim EXPORT HmiPhoneSimulatorTargets
            RUNTIME DESTINATION "${CMAKE_INSTALL_BINDIR}" COMPONENT simulator)
    hmiphone_origin_path(rpath "${CMAKE_INSTALL_BINDIR}" "${HMIPHONE_INSTALL_PLATFORMDIR}")
    file(RELATIVE_PATH plugin "/${CMAKE_INSTALL_BINDIR}" "/${HMIPHONE_INSTALL_PLUGINDIR}")
    set_target_properties(hmiphone-sim PROPERTIES INSTALL_RPATH "${rpath}")
    target_compile_definitions(hmiphone-sim PRIVATE
        HMIPHONE_INSTALLED_PLUGIN="${plugin}/$<TARGET_FILE_NAME:hmiphone>")
    install(EXPORT HmiPhoneSimulatorTargets NAMESPACE HmiPhone::
            DESTINATION "${HMIPHONE_INSTALL_CMAKEDIR}" COMPONENT simulator)
    install(DIRECTORY "${PROJECT_SOURCE_DIR}/examples/"
            DESTINATION "${HMIPHONE_INSTALL_SIM_DOCDIR}/examples" COMPONENT simulator
            FILES_MATCHING PATTERN "*.jsonl")
endif()

# find_package(HmiPhone): the targets above, and the plug-in folder as HmiPhone_PLUGIN_DIR.
configure_package_config_file("${CMAKE_CURRENT_LIST_DIR}/HmiPhoneConfig.cmake.in"
                              "${PROJECT_BINARY_DIR}/HmiPhoneConfig.cmake"
                              INSTALL_DESTINATION "${HMIPHONE_INSTALL_CMAKEDIR}"
                              PATH_VARS HMIPHONE_INSTALL_PLUGINDIR)
write_basic_package_version_file("${PROJECT_BINARY_DIR}/HmiPhoneConfigVersion.cmake"
                                 COMPATIBILITY SameMajorVersion)
install(FILES "${PROJECT_BINARY_DIR}/HmiPhoneConfig.cmake"
              "${PROJECT_BINARY_DIR}/HmiPhoneConfigVersion.cmake"
        DESTINATION "${HMIPHONE_INSTALL_CMAKEDIR}" COMPONENT module)

# Documents: the licence as a Debian package's copyright file, and a Debian changelog made from
# CHANGELOG.md's entry for this version (the packages are native: the project is their upstream).
file(STRINGS "${PROJECT_SOURCE_DIR}/CHANGELOG.md" release
     REGEX "^## \\[${PROJECT_VERSION}\\] - [0-9]+-[0-9]+-[0-9]+$")
if(NOT release MATCHES "([0-9]+-[0-9]+-[0-9]+)$")
    message(FATAL_ERROR "CHANGELOG.md has no release ${PROJECT_VERSION}: add its entry "
                        "(\"## [${PROJECT_VERSION}] - YYYY-MM-DD\").")
endif()
execute_process(COMMAND date -u -R -d "${CMAKE_MATCH_1}" OUTPUT_VARIABLE HMIPHONE_RELEASE_DATE
                OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)
set(packages hmiphone)
if(TARGET hmiphone-sim)
    list(APPEND packages hmiphone-sim)
endif()
foreach(package ${packages})
    file(WRITE "${PROJECT_BINARY_DIR}/debian/${package}/changelog"
         "${package} (${PROJECT_VERSION}) unstable; urgency=medium\n\n"
         "  * Release ${PROJECT_VERSION}: see /usr/share/doc/hmiphone/CHANGELOG.md.\n\n"
         " -- ${HMIPHONE_MAINTAINER}  ${HMIPHONE_RELEASE_DATE}\n")
    execute_process(COMMAND gzip -9 -n -c changelog OUTPUT_FILE changelog.gz
                    WORKING_DIRECTORY "${PROJECT_BINARY_DIR}/debian/${package}"
                    COMMAND_ERROR_IS_FATAL ANY)
endforeach()
install(FILES "${PROJECT_SOURCE_DIR}/README.md" "${PROJECT_SOURCE_DIR}/CHANGELOG.md"
              "${PROJECT_BINARY_DIR}/debian/hmiphone/changelog.gz"
        DESTINATION "${HMIPHONE_INSTALL_DOCDIR}" COMPONENT module)
install(FILES "${PROJECT_SOURCE_DIR}/LICENSE" DESTINATION "${HMIPHONE_INSTALL_DOCDIR}"
        RENAME copyright COMPONENT module)
install(DIRECTORY "${PROJECT_SOURCE_DIR}/docs" DESTINATION "${HMIPHONE_INSTALL_DOCDIR}"
        COMPONENT module)
if(TARGET hmiphone-sim)
    install(FILES "${PROJECT_BINARY_DIR}/debian/hmiphone-sim/changelog.gz"
            DESTINATION "${HMIPHONE_INSTALL_SIM_DOCDIR}" COMPONENT simulator)
    install(FILES "${PROJECT_SOURCE_DIR}/LICENSE" DESTINATION "${HMIPHONE_INSTALL_SIM_DOCDIR}"
            RENAME copyright COMPONENT simulator)
endif()
