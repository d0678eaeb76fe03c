# `cpack -G DEB` in the build folder makes one Debian package per install component: hmiphone (the
# module) and, on the stand-ins, hmiphone-sim (the simulator with its examples and the stand-ins'
# libraries). Their dependencies on Debian's packages come from dpkg-shlibdeps (Debian's dpkg-dev,
# with file).
set(CPACK_PACKAGE_NAME hmiphone)
set(CPACK_PACKAGE_VENDOR "The hmiphone authors")
set(CPACK_PACKAGE_CONTACT "${HMIPHONE_MAINTAINER}")
set(CPACK_RESOURCE_FILE_LICENSE "${PROJECT_SOURCE_DIR}/LICENSE")
set(CPACK_STRIP_FILES ON)
set(CPACK_COMPONENTS_ALL module)
# Debian's descriptions: a synopsis line of each package's own (no summary common to both), then
# lines of at most 80 columns.
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "")
set(CPACK_DEBIAN_MODULE_DESCRIPTION "phone module of a car head unit's HMI (Qt 5 plug-in)
The HMI logic of hands-free telephony: a hierarchical state machine that
decides which phone screen, popup or status-bar message the driver sees. A
host loads the plug-in from /usr/lib/<multiarch>/hmi/modules and provides the
platform's libraries it links.")
if(TARGET hmiphone-sim)
    list(APPEND CPACK_COMPONENTS_ALL simulator)
    set(CPACK_DEBIAN_SIMULATOR_DESCRIPTION "desktop host that runs the HMI phone module
hmiphone-sim loads the phone module's plug-in, plays the phone's side from a
scenario on a virtual clock and prints what the HMI would show. It brings
stand-ins for the host's libraries, and example scenarios.")
    set(CPACK_COMPONENT_SIMULATOR_DEPENDS module)
endif()

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION misc)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_ENABLE_COMPONENT_DEPENDS ON)
set(CPACK_DEBIAN_MODULE_PACKAGE_NAME hmiphone)
set(CPACK_DEBIAN_SIMULATOR_PACKAGE_NAME hmiphone-sim)
# The module's platform libraries are the host's, not a Debian package's: dpkg-shlibdeps finds the
# stand-ins built here (or the host's) and leaves out of the dependencies those that no Debian
# package installed.
# On the host's libraries, they come from wherever their packages lie.
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS "${CMAKE_LIBRARY_OUTPUT_DIRECTORY}")
foreach(library Platform::quorvel Platform::brisken Platform::taldris Platform::mavrosk)
    get_target_property(imported ${library} IMPORTED)
    if(imported)
        get_target_property(location ${library} LOCATION)
        get_filename_component(folder "${location}" DIRECTORY)
        list(APPEND CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS "${folder}")
    endif()
endforeach()
if(HMIPHONE_BUILD_WINDOW)
    # The window's pages import QtQuick 2 at run time.
    set(CPACK_DEBIAN_SIMULATOR_PACKAGE_DEPENDS qml-module-qtquick2)
endif()
include(CPack)
