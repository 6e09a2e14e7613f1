# Uses the library that is installed in PREFIX by pkg-config alone, in WORK_DIR, which is made anew.
#
# STATIC: it is a static one, and needs the platform's logging library, which is in PLATFORM. QUICK:
# the consumer of the view layer for Qt Quick.

include(${CMAKE_CURRENT_LIST_DIR}/commands.cmake)
file(REMOVE_RECURSE ${WORK_DIR})
file(MAKE_DIRECTORY ${WORK_DIR})
set(ENV{PKG_CONFIG_PATH} ${PREFIX}/lib/pkgconfig)
set(program ${WORK_DIR}/consumer)
set(static "")
set(library_dirs -Wl,-rpath,${PREFIX}/lib)
if(STATIC)
    set(static --static)
    set(library_dirs -L${PLATFORM}/lib -Wl,-rpath,${PLATFORM}/lib)
endif()
set(package hmistatemachine)
set(consumer consumer)
if(QUICK)
    set(package hmistatemachinequick)
    set(consumer quickconsumer)
endif()

run(${PKG_CONFIG} --validate ${package})
run(${PKG_CONFIG} --modversion ${package})
expect("^${VERSION}\n$")
run(${PKG_CONFIG} --cflags ${package})
separate_arguments(cflags UNIX_COMMAND "${output}")
run(${PKG_CONFIG} --libs ${static} hmistatemachine)
if(NOT STATIC)
    expect("^-L${PREFIX}/lib/pkgconfig/[./]+/lib -lHmiStateMachine ") # found by the file's place
endif()
run(${PKG_CONFIG} --libs ${static} ${package})
separate_arguments(libs UNIX_COMMAND "${output}")

run(${LAUNCHER} ${CXX_COMPILER} -std=c++${STANDARD} -fPIC ${options} ${cflags}
    -c ${CMAKE_CURRENT_LIST_DIR}/${consumer}/main.cpp -o ${program}.o)
run(${CXX_COMPILER} ${program}.o -o ${program} ${library_dirs} ${libs})
set(ENV{QT_LOGGING_RULES} "*.debug=false")
run(${program})
expect("the radio is shown\n")
