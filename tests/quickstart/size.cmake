# cmake -DEXAMPLE_DIR=.. -DMAXIMUM=.. -P size.cmake
#
# Fails when the C++ and QML of the example have more lines than that, blank ones included.

cmake_minimum_required(VERSION 3.22)

set(total 0)
foreach(pattern IN ITEMS *.cpp *.h *.qml)
    file(GLOB files ${EXAMPLE_DIR}/${pattern})
    if(NOT files)
        message(FATAL_ERROR "No ${pattern} in ${EXAMPLE_DIR}")
    endif()
    foreach(file IN LISTS files)
        file(READ ${file} text)
        string(REGEX MATCHALL "\n" lines "${text}")
        list(LENGTH lines count)
        math(EXPR total "${total} + ${count}")
    endforeach()
endforeach()
message(STATUS "${total} lines")
if(total GREATER MAXIMUM)
    message(FATAL_ERROR "The example has ${total} lines, more than ${MAXIMUM}")
endif()
