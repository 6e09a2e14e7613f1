# What CPack makes Debian packages of, one for each component of the installation. scripts/package
# builds what they hold; any build can be packed, to /usr.

set(HMISTATEMACHINE_PACKAGE_MAINTAINER "HmiStateMachine developers <developers@hmistatemachine.example>"
    CACHE STRING "Who answers for the Debian packages: name <address>")

# The guide; docs/api brings the reference of the classes, where it was built.
file(GLOB guide CONFIGURE_DEPENDS docs/*.md)
install(FILES README.md CHANGELOG.md DESTINATION ${CMAKE_INSTALL_DOCDIR} COMPONENT documentation)
install(FILES ${guide} DESTINATION ${CMAKE_INSTALL_DOCDIR}/docs COMPONENT documentation)
install(DIRECTORY docs/images DESTINATION ${CMAKE_INSTALL_DOCDIR}/docs COMPONENT documentation)

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME hmistatemachine)
set(CPACK_PACKAGE_VENDOR "HmiStateMachine developers")
set(CPACK_PACKAGE_CONTACT "${HMISTATEMACHINE_PACKAGE_MAINTAINER}")
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_VERBATIM_VARIABLES ON)
set(CPACK_STRIP_FILES ON)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
    OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CPACK_PRE_BUILD_SCRIPTS ${PROJECT_SOURCE_DIR}/cmake/HmiStateMachineDebianFiles.cmake)
set(CPACK_HMISTATEMACHINE_SOURCE_DIR ${PROJECT_SOURCE_DIR}) # for that script

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_RELEASE 1)
set(CPACK_DEBIAN_COMPRESSION_TYPE xz)
set(CPACK_DEBIAN_PACKAGE_SOURCE hmistatemachine)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_ENABLE_COMPONENT_DEPENDS ON) # in the very same version
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS
    ${PROJECT_BINARY_DIR}/src/HmiStateMachine ${PROJECT_BINARY_DIR}/src/HmiStateMachineQuick)
set(CPACK_COMPONENTS_ALL "")

set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON) # what is linked to the libraries depends on them
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS_POLICY ">=")

# hmi_debian_package(<component> <package> <section> <summary> <description>
#                    [LIBRARY] [PROGRAMS] [DEPENDS <component>...] [NEEDS <package>,...])
#
# DEPENDS: components, whose packages it needs in the very same version. NEEDS: other packages.
# PROGRAMS: what its programs need is found out. LIBRARY: that too, and its libraries are announced.
function(hmi_debian_package component package section summary description)
    cmake_parse_arguments(PARSE_ARGV 5 arg "LIBRARY;PROGRAMS" "NEEDS" "DEPENDS")
    string(TOUPPER ${component} name)
    set(CPACK_COMPONENTS_ALL ${CPACK_COMPONENTS_ALL} ${component} PARENT_SCOPE)
    set(CPACK_COMPONENT_${name}_DEPENDS ${arg_DEPENDS} PARENT_SCOPE)
    set(CPACK_DEBIAN_${name}_PACKAGE_NAME ${package} PARENT_SCOPE)
    set(CPACK_DEBIAN_${name}_PACKAGE_SECTION ${section} PARENT_SCOPE)
    set(CPACK_DEBIAN_${name}_DESCRIPTION "${summary}\n${description}" PARENT_SCOPE)
    set(CPACK_DEBIAN_${name}_PACKAGE_DEPENDS "${arg_NEEDS}" PARENT_SCOPE)
    set(shlibdeps OFF)
    if(arg_LIBRARY OR arg_PROGRAMS)
        set(shlibdeps ON)
    endif()
    set(CPACK_DEBIAN_${name}_PACKAGE_SHLIBDEPS ${shlibdeps} PARENT_SCOPE)
    if(arg_LIBRARY)
        # CPack writes a postinst and a postrm that call ldconfig, unless it is told of others, even of
        # some that do not exist. The trigger does it.
        set(CPACK_DEBIAN_${name}_PACKAGE_CONTROL_EXTRA
            ${PROJECT_SOURCE_DIR}/cmake/debian/triggers
            ${PROJECT_BINARY_DIR}/none/postinst ${PROJECT_BINARY_DIR}/none/postrm PARENT_SCOPE)
    endif()
endfunction()

set(about "HmiStateMachine is a library on Qt 5's state machine framework for the screen
logic of a vehicle's infotainment head unit: named states, views with back
stacks, popups that interrupt one another by rules, and transitions that are
arbitrated across parallel regions.
.")

hmi_debian_package(runtime libhmistatemachine${PROJECT_VERSION_MAJOR} libs
    "states and transitions for an infotainment head unit"
    "${about}\nThis package contains the library." LIBRARY)
hmi_debian_package(development libhmistatemachine-dev libdevel
    "states and transitions for an infotainment head unit - headers"
    "${about}\nThis package contains what is needed to build with the library: headers, and
its description for CMake, pkg-config and qmake."
    DEPENDS runtime NEEDS "qtbase5-dev (>= 5.15)")
if(HMISTATEMACHINE_WITH_QUICK)
    hmi_debian_package(quick_runtime libhmistatemachinequick${PROJECT_VERSION_MAJOR} libs
        "view layer for Qt Quick of HmiStateMachine"
        "${about}\nThis package contains the view layer for Qt Quick: views and popups as QML
components." LIBRARY DEPENDS runtime NEEDS "qml-module-qtquick2")
    hmi_debian_package(quick_development libhmistatemachinequick-dev libdevel
        "view layer for Qt Quick of HmiStateMachine - headers"
        "${about}\nThis package contains what is needed to build with the view layer for Qt Quick."
        DEPENDS quick_runtime development NEEDS "qtdeclarative5-dev (>= 5.15)")
    hmi_debian_package(qml qml-module-hmistatemachine libs
        "QML module of HmiStateMachine"
        "${about}\nThis package contains the QML module, for programs that are not linked to
the view layer for Qt Quick, and for tools."
        PROGRAMS DEPENDS quick_runtime runtime)
endif()
if(HMISTATEMACHINE_WITH_RULES_TOOL)
    hmi_debian_package(tools hmistatemachine-tools devel
        "checks rules by which popups interrupt one another"
        "${about}\nThis package contains hmi-rules, which checks, explains, draws and compares
files of interruption rules, and JSON Schemas of them for editors."
        PROGRAMS DEPENDS runtime)
endif()
hmi_debian_package(documentation hmistatemachine-doc doc
    "states and transitions for an infotainment head unit - documentation"
    "${about}\nThis package contains the guide, and the reference of the classes where it
was built.")
set(CPACK_DEBIAN_DOCUMENTATION_PACKAGE_ARCHITECTURE all)

include(CPack)
