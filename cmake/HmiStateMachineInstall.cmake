# How a library is installed for those who build with CMake, pkg-config or qmake. Components of the
# installation: runtime, development, quick_runtime, quick_development, qml, tools, documentation.
#
# All that is found by its place, so that the installed tree can be moved. Written without
# extra-cmake-modules: a target's toolchain seldom has them, and they know no static library for qmake.

set(HMISTATEMACHINE_PACKAGE_DIR ${CMAKE_INSTALL_LIBDIR}/cmake/HmiStateMachine)

# hmi_install_library(<target> DESCRIPTION <text> RUNTIME <component> DEVELOPMENT <component>
#                     HEADERS <header>... [PRIVATE_LIBRARIES <library>...]
#                     PKGCONFIG_REQUIRES <packages> QMAKE_DEPENDS <module>...)
#
# Headers are relative to the sources, or generated. A static library leaves the libraries that it
# needs to whoever links it: PRIVATE_LIBRARIES.
function(hmi_install_library target)
    cmake_parse_arguments(PARSE_ARGV 1 arg "" "DESCRIPTION;RUNTIME;DEVELOPMENT;PKGCONFIG_REQUIRES"
        "HEADERS;PRIVATE_LIBRARIES;QMAKE_DEPENDS")
    install(TARGETS ${target} EXPORT ${target}Targets
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
            COMPONENT ${arg_RUNTIME} NAMELINK_COMPONENT ${arg_DEVELOPMENT}
        ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT ${arg_DEVELOPMENT})
    install(EXPORT ${target}Targets
        NAMESPACE HmiStateMachine::
        DESTINATION ${HMISTATEMACHINE_PACKAGE_DIR} COMPONENT ${arg_DEVELOPMENT})
    foreach(header IN LISTS arg_HEADERS)
        set(folder "")
        if(NOT IS_ABSOLUTE ${header})
            get_filename_component(folder ${header} DIRECTORY)
        endif()
        install(FILES ${header}
            DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/${target}/${folder} COMPONENT ${arg_DEVELOPMENT})
    endforeach()
    hmi_install_pkgconfig_file()
    hmi_install_qmake_module()
endfunction()

function(hmi_path_to_prefix dir variable)
    file(RELATIVE_PATH path /${dir} /)
    string(REGEX REPLACE "/$" "" path ${path})
    set(${variable} ${path} PARENT_SCOPE)
endfunction()

# Both read what hmi_install_library() was given.
function(hmi_install_pkgconfig_file)
    set(dir ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
    hmi_path_to_prefix(${dir} prefix_from_here)
    set(static_define "")
    if(NOT BUILD_SHARED_LIBS)
        string(TOUPPER "-D${target}_STATIC_DEFINE" static_define)
    endif()
    list(TRANSFORM arg_PRIVATE_LIBRARIES PREPEND -l OUTPUT_VARIABLE private_libraries)
    list(JOIN private_libraries " " private_libraries)
    string(TOLOWER ${target}.pc file)
    configure_file(${PROJECT_SOURCE_DIR}/cmake/pkgconfig.pc.in ${file} @ONLY)
    install(FILES ${CMAKE_CURRENT_BINARY_DIR}/${file}
        DESTINATION ${dir} COMPONENT ${arg_DEVELOPMENT})
endfunction()

function(hmi_install_qmake_module)
    set(dir ${HMISTATEMACHINE_INSTALL_MKSPECSDIR}/modules)
    hmi_path_to_prefix(${dir} prefix_from_here)
    set(module_config "")
    set(static_define "")
    if(NOT BUILD_SHARED_LIBS)
        set(module_config staticlib)
        string(TOUPPER ${target}_STATIC_DEFINE static_define)
    endif()
    list(JOIN arg_QMAKE_DEPENDS " " depends)
    set(private_use "")
    if(arg_PRIVATE_LIBRARIES)
        list(TRANSFORM arg_PRIVATE_LIBRARIES PREPEND -l OUTPUT_VARIABLE libraries)
        list(JOIN libraries " " libraries)
        string(TOUPPER ${target} use)
        set(private_use "QT.${target}.uses = ${target}\nQMAKE_LIBS_${use} = ${libraries}")
    endif()
    set(file qt_${target}.pri)
    configure_file(${PROJECT_SOURCE_DIR}/cmake/qmakemodule.pri.in ${file} @ONLY)
    install(FILES ${CMAKE_CURRENT_BINARY_DIR}/${file}
        DESTINATION ${dir} COMPONENT ${arg_DEVELOPMENT})
endfunction()
