# Public headers: their list, and what is generated beside them in ${PROJECT_BINARY_DIR}/include, the
# same for the build tree, for add_subdirectory() and once installed.

set(HMISTATEMACHINE_GENERATED_DIR ${PROJECT_BINARY_DIR}/include)

# hmi_public_headers(<library> <prefix> <class>[=<header>]... UMBRELLA <header>...)
#
# Each class has its header, folder/Class that of the same name in lower case, and a forwarding header
# <library/Class>; <library/library> includes all headers, and before them what UMBRELLA names.
# Sets <prefix>_HEADERS, relative to the library's sources, and <prefix>_GENERATED_HEADERS.
function(hmi_public_headers library prefix)
    cmake_parse_arguments(PARSE_ARGV 2 arg "" "" "UMBRELLA")
    set(folder ${HMISTATEMACHINE_GENERATED_DIR}/${library})
    string(TOLOWER ${library} umbrella)
    set(headers "")
    set(generated ${folder}/${library} ${folder}/${umbrella}.h)
    foreach(entry IN LISTS arg_UNPARSED_ARGUMENTS)
        string(REGEX MATCH "^([^=]+)=?(.*)$" entry ${entry})
        set(header "${CMAKE_MATCH_2}")
        get_filename_component(class ${CMAKE_MATCH_1} NAME)
        if(NOT header)
            string(TOLOWER ${CMAKE_MATCH_1}.h header)
        endif()
        hmi_forwarding_header(${folder}/${class} ${library}/${header})
        list(APPEND headers ${header})
        list(APPEND generated ${folder}/${class})
    endforeach()
    list(REMOVE_DUPLICATES headers)

    hmi_forwarding_header(${folder}/${library} ${library}/${umbrella}.h)
    list(TRANSFORM headers PREPEND ${library}/ OUTPUT_VARIABLE included)
    hmi_forwarding_header(${folder}/${umbrella}.h ${arg_UMBRELLA} ${included})
    set(${prefix}_HEADERS ${headers} PARENT_SCOPE)
    set(${prefix}_GENERATED_HEADERS ${generated} PARENT_SCOPE)
endfunction()

# Writes a header that includes others, when that changes it.
function(hmi_forwarding_header file)
    list(TRANSFORM ARGN REPLACE "(.+)" "#include <\\1>\n" OUTPUT_VARIABLE lines)
    list(JOIN lines "" lines)
    file(CONFIGURE OUTPUT ${file} CONTENT "#pragma once\n\n${lines}" @ONLY)
endfunction()
