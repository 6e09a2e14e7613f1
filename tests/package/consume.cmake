# Uses the library as another project with CMake does, in WORK_DIR, which is made anew.
#
# PREFIX: where it is installed. PLATFORM: where the platform's logging library is, if that is asked
# for. Without PREFIX it is a subfolder, shared or STATIC. QUICK: with the view layer for Qt Quick;
# without, Qt Quick is hidden. VIEWER_SOURCE: a program that loads the QML module's plugin, too.

include(${CMAKE_CURRENT_LIST_DIR}/commands.cmake)
file(REMOVE_RECURSE ${WORK_DIR})

if(PREFIX)
    set(library -DCMAKE_PREFIX_PATH=${PREFIX} -DVERSION=${VERSION} -DHmiLogging_ROOT=${PLATFORM})
else()
    set(library -DHMISTATEMACHINE_SOURCE_DIR=${SOURCE_DIR} -DHMISTATEMACHINE_PLATFORM_LOGGING=OFF)
    if(STATIC)
        list(APPEND library -DBUILD_SHARED_LIBS=OFF)
    endif()
endif()

if(QUICK)
    set(consumer quickconsumer)
    set(quick -DVIEWER_SOURCE=${VIEWER_SOURCE})
else()
    set(consumer consumer)
    set(quick -DCMAKE_DISABLE_FIND_PACKAGE_Qt5Qml=ON -DCMAKE_DISABLE_FIND_PACKAGE_Qt5Quick=ON)
endif()
list(JOIN options " " options)
run(${configure} -S ${CMAKE_CURRENT_LIST_DIR}/${consumer} -B ${WORK_DIR}/consumer
    -DCMAKE_CXX_STANDARD=${STANDARD} "-DOPTIONS=${options}" ${library} ${quick})
if(NOT PREFIX)
    expect("Logging: the stand-in in platform/standin \\(HMISTATEMACHINE_PLATFORM_LOGGING=OFF\\)")
    if(NOT QUICK)
        expect("View layer for Qt Quick: OFF \\(HMISTATEMACHINE_BUILD_QUICK=AUTO\\)")
    endif()
endif()
run(${CMAKE_COMMAND} --build ${WORK_DIR}/consumer)
if(NOT PREFIX AND EXISTS ${WORK_DIR}/consumer/library/tests)
    message(FATAL_ERROR "A subproject builds the library's tests")
endif()
set(ENV{QT_LOGGING_RULES} "*.debug=false")
run(${WORK_DIR}/consumer/consumer)
if(QUICK)
    expect("the radio is shown\n") # and the warning that brings the banner
else()
    expect("^${VERSION}: the radio is shown\n$")
endif()
if(VIEWER_SOURCE)
    # The module's plugin is found by a program that is linked to the library, too.
    set(ENV{QML2_IMPORT_PATH} ${PREFIX}/lib/qt5/qml)
    run(${WORK_DIR}/consumer/consumer)
    expect("the radio is shown\n")
    run(${CMAKE_COMMAND} --build ${WORK_DIR}/consumer --target view)
    expect("a scene with the effect 2\n")
endif()
