# Compiles each of HEADERS, which lie in FOLDER, as the only include of a source file, and those of
# TOGETHER, of which it takes the names, in one; in the strictest settings that an application may choose.

set(options -std=c++${STANDARD} -fsyntax-only -fPIC -x c++
    -Wall -Wextra -Wpedantic -Wshadow -Woverloaded-virtual -Werror
    -DQT_NO_KEYWORDS -DQT_NO_CAST_FROM_ASCII -DQT_NO_CAST_TO_ASCII -DQT_NO_FOREACH
    -DQT_STRICT_ITERATORS)
foreach(dir IN LISTS INCLUDE_DIRS)
    list(APPEND options -I${dir})
endforeach()
foreach(dir IN LISTS SYSTEM_INCLUDE_DIRS)
    list(APPEND options -isystem ${dir})
endforeach()

list(LENGTH HEADERS count)
if(count LESS 2)
    message(FATAL_ERROR "No headers to compile")
endif()
set(failures "")
get_filename_component(compiler_name ${COMPILER} NAME)
set(source_file header-${FOLDER}-${compiler_name}-${STANDARD}.cpp.in)

# Each of the headers given is included twice: it guards itself.
function(try name)
    list(TRANSFORM ARGN REPLACE "(.+)" "#include <${FOLDER}/\\1>\n" OUTPUT_VARIABLE includes)
    list(JOIN includes "" source)
    file(WRITE ${source_file} "${source}${source}")
    execute_process(
        COMMAND ${COMPILER} ${options} -
        INPUT_FILE ${source_file}
        RESULT_VARIABLE result
        ERROR_VARIABLE errors)
    if(NOT result EQUAL 0)
        set(failures ${failures} ${name} PARENT_SCOPE)
        message("${name}:\n${errors}")
    endif()
endfunction()

foreach(header IN LISTS HEADERS)
    try(${header} ${header})
endforeach()
list(TRANSFORM TOGETHER REPLACE "^.*/" "")
try("those together" ${TOGETHER})
if(failures)
    message(FATAL_ERROR "Do not compile alone with ${COMPILER} as C++${STANDARD}: ${failures}")
endif()
message(STATUS "${count} headers compile alone with ${COMPILER} as C++${STANDARD}")
