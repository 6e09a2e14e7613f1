# Compares what qmlplugindump says of the module with the file that is delivered, without comments:
# they tell how the tool was called.

execute_process(COMMAND ${DUMP} -nonrelocatable HmiStateMachine 1.0 ${QML_DIR}
    OUTPUT_VARIABLE actual ERROR_VARIABLE errors RESULT_VARIABLE result)
if(NOT result EQUAL 0)
    message(FATAL_ERROR "${DUMP}: ${result}\n${errors}")
endif()
file(WRITE ${ACTUAL} "${actual}")
file(READ ${EXPECTED} expected)
foreach(text IN ITEMS actual expected)
    string(REGEX REPLACE "(^|\n)//[^\n]*" "" ${text} "${${text}}")
    string(STRIP "${${text}}" ${text})
endforeach()
if(NOT actual MATCHES "name: \"HmiStateMachine::ScreenHost\"")
    message(FATAL_ERROR "The module is not in what ${DUMP} says:\n${actual}")
endif()
if(NOT actual STREQUAL expected)
    message(FATAL_ERROR "Out of date: ${EXPECTED}\nWhat it should say: ${ACTUAL}")
endif()
