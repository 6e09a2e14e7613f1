# Uses the library that is installed in PREFIX as a module of qmake, in WORK_DIR, which is made anew.
#
# PLATFORM: where the platform's logging library is, which a static library needs. QUICK: the consumer
# of the view layer for Qt Quick.

include(${CMAKE_CURRENT_LIST_DIR}/commands.cmake)
file(REMOVE_RECURSE ${WORK_DIR})
file(MAKE_DIRECTORY ${WORK_DIR})
set(ENV{QMAKEMODULES} ${PREFIX}/lib/qt5/mkspecs/modules)
set(ENV{LD_LIBRARY_PATH} ${PREFIX}/lib:${PLATFORM}/lib)
set(consumer consumer)
if(QUICK)
    set(consumer quickconsumer)
endif()
list(JOIN options " " options)

run(${CMAKE_COMMAND} -E chdir ${WORK_DIR}
    ${QMAKE} ${CMAKE_CURRENT_LIST_DIR}/${consumer}/consumer.pro
    "QMAKE_CXX=${LAUNCHER} ${CXX_COMPILER}" "QMAKE_CXXFLAGS+=${options} -std=c++${STANDARD}"
    "QMAKE_LIBDIR+=${PLATFORM}/lib")
run(${MAKE} -C ${WORK_DIR})
set(ENV{QT_LOGGING_RULES} "*.debug=false")
run(${WORK_DIR}/consumer)
expect("the radio is shown\n")
