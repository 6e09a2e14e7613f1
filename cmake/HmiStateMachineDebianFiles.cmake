# Run by CPack between installing and packing: gives each package the files that Debian wants in it.

if("$ENV{SOURCE_DATE_EPOCH}" STREQUAL "")
    string(TIMESTAMP now "%s" UTC)
    set(ENV{SOURCE_DATE_EPOCH} ${now})
endif()
string(TIMESTAMP date "%a, %d %b %Y %H:%M:%S +0000" UTC) # of SOURCE_DATE_EPOCH
set(templates ${CPACK_HMISTATEMACHINE_SOURCE_DIR}/cmake/debian)

function(run)
    execute_process(COMMAND ${ARGN} COMMAND_ERROR_IS_FATAL ANY)
endfunction()

function(add_doc_files root component package)
    set(doc ${root}/usr/share/doc/${package})
    configure_file(${templates}/changelog.in ${doc}/changelog.Debian @ONLY)
    configure_file(${CPACK_HMISTATEMACHINE_SOURCE_DIR}/CHANGELOG.md ${doc}/changelog COPYONLY)
    run(gzip -9n ${doc}/changelog.Debian ${doc}/changelog)
    configure_file(${templates}/copyright.in ${doc}/copyright @ONLY)
    if(component STREQUAL "tools")
        # Headers that hmi-rules is compiled with: their licences go with the program.
        foreach(source IN ITEMS nlohmann-json3-dev libcli11-dev)
            file(READ /usr/share/doc/${source}/copyright text)
            file(APPEND ${doc}/copyright "\n\nhmi-rules contains code of ${source}:\n\n${text}")
        endforeach()
    endif()
endfunction()

# Debian's loader finds the libraries where they are. What an installed tree that can be moved needs
# instead is taken out.
function(remove_run_paths root)
    file(GLOB_RECURSE files ${root}/usr/bin/* ${root}/usr/lib/*.so*)
    foreach(file IN LISTS files)
        if(NOT IS_SYMLINK ${file})
            file(RPATH_REMOVE FILE ${file})
        endif()
    endforeach()
endfunction()

foreach(component IN LISTS CPACK_COMPONENTS_ALL)
    set(root ${CPACK_TEMPORARY_DIRECTORY}/${component})
    string(TOUPPER ${component} name)
    add_doc_files(${root} ${component} ${CPACK_DEBIAN_${name}_PACKAGE_NAME})
    remove_run_paths(${root})
    file(GLOB man_pages ${root}/usr/share/man/man*/*.[0-9])
    if(man_pages)
        run(gzip -9n ${man_pages})
    endif()
    run(find ${root} -exec touch --no-dereference --date=@$ENV{SOURCE_DATE_EPOCH} {} +)
endforeach()
