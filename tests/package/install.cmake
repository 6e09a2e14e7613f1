# Installs the library below WORK_DIR/prefix, made anew, for the tests that use it from there.
#
# BUILD_DIR: this build. Without, a static library is built in WORK_DIR first, with the stand-in as
# the platform's logging library.

include(${CMAKE_CURRENT_LIST_DIR}/commands.cmake)
file(REMOVE_RECURSE ${WORK_DIR}/prefix)

if(NOT BUILD_DIR)
    set(BUILD_DIR ${WORK_DIR}/library)
    run(${configure} -S ${CMAKE_CURRENT_LIST_DIR}/platformlogging -B ${WORK_DIR}/logging
        -DSTANDIN_DIR=${SOURCE_DIR}/platform/standin -DCMAKE_INSTALL_PREFIX=${WORK_DIR}/platform)
    run(${CMAKE_COMMAND} --build ${WORK_DIR}/logging --target install)
    run(${configure} -S ${SOURCE_DIR} -B ${BUILD_DIR} -DBUILD_SHARED_LIBS=OFF
        -DHMISTATEMACHINE_BUILD_TESTS=OFF -DHMISTATEMACHINE_BUILD_EXAMPLES=OFF
        -DHMISTATEMACHINE_WERROR=ON
        -DHMISTATEMACHINE_PLATFORM_LOGGING=ON -DHmiLogging_ROOT=${WORK_DIR}/platform)
    expect("Logging: the platform's library \\(${WORK_DIR}/platform/lib/libHmiLogging")
    run(${CMAKE_COMMAND} --build ${BUILD_DIR})
endif()
run(${CMAKE_COMMAND} --install ${BUILD_DIR} --prefix ${WORK_DIR}/prefix)
