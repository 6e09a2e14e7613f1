# Uses the library as another project does, in WORK_DIR, which is made anew.
#
# BUILD_DIR: install this build. STATIC, PLATFORM_LOGGING: build the library so first, and install
# that. SUBPROJECT: add it as a subfolder instead. QUICK: with the view layer for Qt Quick; without,
# Qt Quick is hidden. VIEWER_SOURCE: a program that loads the QML module's plugin, too.

function(run)
    execute_process(COMMAND ${ARGN} RESULT_VARIABLE result OUTPUT_VARIABLE output
        ERROR_VARIABLE output)
    if(NOT result EQUAL 0)
        string(REPLACE ";" " " command "${ARGN}")
        message(FATAL_ERROR "${command}\n${output}")
    endif()
    set(output "${output}" PARENT_SCOPE)
endfunction()

function(expect text)
    if(NOT output MATCHES "${text}")
        message(FATAL_ERROR "Expected \"${text}\" in:\n${output}")
    endif()
endfunction()

file(REMOVE_RECURSE ${WORK_DIR})
set(prefix ${WORK_DIR}/prefix)
set(configure ${CMAKE_COMMAND} -G Ninja -DCMAKE_BUILD_TYPE=Debug
    -DCMAKE_CXX_COMPILER=${CXX_COMPILER} -DCMAKE_CXX_COMPILER_LAUNCHER=${LAUNCHER})

set(platform_logging "")
if(PLATFORM_LOGGING)
    # The stand-in, built as if it were the platform's own library.
    run(${configure} -S ${CMAKE_CURRENT_LIST_DIR}/platformlogging -B ${WORK_DIR}/logging
        -DSTANDIN_DIR=${SOURCE_DIR}/platform/standin -DCMAKE_INSTALL_PREFIX=${WORK_DIR}/platform)
    run(${CMAKE_COMMAND} --build ${WORK_DIR}/logging --target install)
    set(platform_logging -DHmiLogging_ROOT=${WORK_DIR}/platform)
endif()

if(STATIC)
    run(${configure} -S ${SOURCE_DIR} -B ${WORK_DIR}/library -DBUILD_SHARED_LIBS=OFF
        -DHMISTATEMACHINE_BUILD_TESTS=OFF -DHMISTATEMACHINE_BUILD_EXAMPLES=OFF
        -DHMISTATEMACHINE_WERROR=ON
        -DHMISTATEMACHINE_PLATFORM_LOGGING=ON ${platform_logging})
    expect("Logging: the platform's library \\(${WORK_DIR}/platform/lib/libHmiLogging")
    run(${CMAKE_COMMAND} --build ${WORK_DIR}/library)
    set(BUILD_DIR ${WORK_DIR}/library)
endif()

if(SUBPROJECT)
    set(library -DHMISTATEMACHINE_SOURCE_DIR=${SOURCE_DIR} -DHMISTATEMACHINE_PLATFORM_LOGGING=OFF)
else()
    run(${CMAKE_COMMAND} --install ${BUILD_DIR} --prefix ${prefix})
    set(library -DCMAKE_PREFIX_PATH=${prefix} -DVERSION=${VERSION})
endif()

if(QUICK)
    set(consumer quickconsumer)
    set(quick -DVIEWER_SOURCE=${VIEWER_SOURCE})
else()
    set(consumer consumer)
    set(quick -DCMAKE_DISABLE_FIND_PACKAGE_Qt5Qml=ON -DCMAKE_DISABLE_FIND_PACKAGE_Qt5Quick=ON)
endif()
run(${configure} -S ${CMAKE_CURRENT_LIST_DIR}/${consumer} -B ${WORK_DIR}/consumer
    ${library} ${platform_logging} ${quick})
if(SUBPROJECT)
    expect("Logging: the stand-in in platform/standin \\(HMISTATEMACHINE_PLATFORM_LOGGING=OFF\\)")
    if(NOT QUICK)
        expect("View layer for Qt Quick: OFF \\(HMISTATEMACHINE_BUILD_QUICK=AUTO\\)")
    endif()
endif()
run(${CMAKE_COMMAND} --build ${WORK_DIR}/consumer)
if(SUBPROJECT AND EXISTS ${WORK_DIR}/consumer/library/tests)
    message(FATAL_ERROR "A subproject builds the library's tests")
endif()
set(ENV{QT_LOGGING_RULES} "*.debug=false")
run(${WORK_DIR}/consumer/consumer)
if(QUICK)
    expect("the radio is shown\n") # and the warning that brings the banner
else()
    expect("^the radio is shown\n$")
endif()
if(VIEWER_SOURCE)
    run(${CMAKE_COMMAND} --build ${WORK_DIR}/consumer --target view)
    expect("a scene with the effect 2\n")
endif()
