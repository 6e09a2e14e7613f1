# find_package() refuses what the package in PREFIX does not have, and says why. BUILD_DIR is installed
# once more in WORK_DIR, without the view layer for Qt Quick and without hmi-rules.

include(${CMAKE_CURRENT_LIST_DIR}/commands.cmake)
file(REMOVE_RECURSE ${WORK_DIR})
set(core ${WORK_DIR}/core)
foreach(component IN ITEMS runtime development)
    run(${CMAKE_COMMAND} --install ${BUILD_DIR} --prefix ${core} --component ${component})
endforeach()

# Configures a project with one find_package(); sets result and output.
function(find prefix request)
    file(WRITE ${WORK_DIR}/project/CMakeLists.txt "cmake_minimum_required(VERSION 3.22)\n"
        "project(Refused LANGUAGES CXX)\nfind_package(HmiStateMachine ${request})\n"
        "message(STATUS \"found: \${HmiStateMachine_FOUND}, Quick: \${HmiStateMachine_Quick_FOUND}\")\n")
    execute_process(
        COMMAND ${configure} -S ${WORK_DIR}/project -B ${WORK_DIR}/build
            -UHmiStateMachine_DIR -DCMAKE_PREFIX_PATH=${prefix} ${ARGN}
        RESULT_VARIABLE result OUTPUT_VARIABLE output ERROR_VARIABLE output)
    string(REGEX REPLACE "[ \n]+" " " output "${output}")
    set(result ${result} PARENT_SCOPE)
    set(output "${output}" PARENT_SCOPE)
endfunction()

function(expect_found prefix request text)
    find(${prefix} "${request}" ${ARGN})
    expect("${text}")
    if(NOT result EQUAL 0)
        message(FATAL_ERROR "find_package(HmiStateMachine ${request}) failed:\n${output}")
    endif()
endfunction()

function(expect_refused prefix request text)
    find(${prefix} "${request}" ${ARGN})
    expect("${text}")
    if(result EQUAL 0)
        message(FATAL_ERROR "find_package(HmiStateMachine ${request}) succeeded:\n${output}")
    endif()
endfunction()

string(REGEX MATCH "^[0-9]+" major ${VERSION})
math(EXPR next_major "${major} + 1")
set(found "found: 1")
expect_found(${PREFIX} "${major} REQUIRED" "${found}")
expect_refused(${PREFIX} "${next_major} REQUIRED" "requested version \"${next_major}\"")
expect_refused(${PREFIX} "${major}.999 REQUIRED" "requested version \"${major}.999\"")
expect_refused(${PREFIX} "REQUIRED COMPONENTS Slow"
    "No component Slow of HmiStateMachine: there are Core, Quick and Rules")
expect_found(${PREFIX} "REQUIRED OPTIONAL_COMPONENTS Slow" "${found}")

expect_found(${core} "REQUIRED COMPONENTS Core" "${found}")
expect_found(${core} "REQUIRED OPTIONAL_COMPONENTS Quick" "found: 1, Quick: OFF")
expect_refused(${core} "REQUIRED COMPONENTS Quick"
    "No component Quick of HmiStateMachine: the view layer for Qt Quick is not installed here")
expect_refused(${core} "REQUIRED COMPONENTS Rules"
    "No component Rules of HmiStateMachine: the tool hmi-rules is not installed here")
if(WITH_QUICK)
    expect_found(${PREFIX} "REQUIRED COMPONENTS Quick" "found: 1, Quick: ON")
    expect_refused(${PREFIX} "REQUIRED COMPONENTS Quick"
        "No component Quick of HmiStateMachine: it needs Qt 5.15 Qml and Quick, which are not found"
        -DCMAKE_DISABLE_FIND_PACKAGE_Qt5Quick=ON)
endif()
