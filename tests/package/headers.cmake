# Compiles each of HEADERS, which lie in FOLDER, as the only include of a source file, in the strictest settings that an
# application may choose.

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
foreach(header IN LISTS HEADERS)
    # Twice: a header guards itself.
    set(source "#include <${FOLDER}/${header}>\n#include <${FOLDER}/${header}>\n")
    file(WRITE ${source_file} "${source}")
    execute_process(
        COMMAND ${COMPILER} ${options} -
        INPUT_FILE ${source_file}
        RESULT_VARIABLE result
        ERROR_VARIABLE errors)
    if(NOT result EQUAL 0)
        list(APPEND failures ${header})
        message("${header}:\n${errors}")
    endif()
endforeach()
if(failures)
    message(FATAL_ERROR "Do not compile alone with ${COMPILER} as C++${STANDARD}: ${failures}")
endif()
message(STATUS "${count} headers compile alone with ${COMPILER} as C++${STANDARD}")
