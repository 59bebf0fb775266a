cmake_minimum_required(VERSION 3.25)

function(run)
    execute_process(COMMAND ${ARGN} RESULT_VARIABLE result OUTPUT_VARIABLE output ERROR_VARIABLE output)
    if(NOT result EQUAL 0)
        list(JOIN ARGN " " command)
        message(FATAL_ERROR "${command}\nended with ${result}:\n${output}")
    endif()
    set(output "${output}" PARENT_SCOPE)
endfunction()

file(REMOVE_RECURSE ${WORK_DIR})
set(installed ${WORK_DIR}/installed)
set(prefix ${WORK_DIR}/moved)
set(config)
if(CONFIG)
    set(config --config ${CONFIG})
endif()
run(${CMAKE_COMMAND} --install ${BUILD_DIR} --prefix ${installed} ${config})
# An installed tree must not know the place that it was installed to.
file(RENAME ${installed} ${prefix})

# What others wrote and the program contains comes with their notices.
if(EXISTS ${prefix}/bin/qrxdeck)
    foreach(package nlohmann-json3-dev libcli11-dev)
        if(NOT EXISTS ${prefix}/share/doc/qrxdeck/notices/${package})
            message(FATAL_ERROR "the installed tree has no notice of ${package}")
        endif()
    endforeach()
endif()

if(WAY STREQUAL "find_package")
    run(${CMAKE_COMMAND} -S ${SOURCE_DIR} -B ${WORK_DIR}/build -G ${GENERATOR}
        -D CMAKE_PREFIX_PATH=${prefix} -D CMAKE_BUILD_TYPE=${CONFIG} -D CMAKE_CXX_COMPILER=${COMPILER}
        -D "CMAKE_CXX_FLAGS=${FLAGS}" -D CMAKE_FIND_USE_PACKAGE_REGISTRY=OFF -D EXPECTED_VERSION=${VERSION})
    run(${CMAKE_COMMAND} --build ${WORK_DIR}/build ${config})
    file(GLOB_RECURSE program ${WORK_DIR}/build/qrx_consumer)
else()
    set(ENV{PKG_CONFIG_PATH} ${prefix}/${LIBDIR}/pkgconfig)
    run(${WAY} --modversion QRXZptInputFileWriter)
    string(STRIP "${output}" version)
    if(NOT version STREQUAL VERSION)
        message(FATAL_ERROR "pkg-config found version '${version}', expected '${VERSION}'")
    endif()
    run(${WAY} --cflags --libs QRXZptInputFileWriter)
    separate_arguments(library UNIX_COMMAND "${output}")
    separate_arguments(flags UNIX_COMMAND "${FLAGS}")
    set(program ${WORK_DIR}/qrx_consumer)
    # What the standard is, pkg-config says.
    run(${COMPILER} ${flags} ${SOURCE_DIR}/main.cpp -o ${program} ${library})
    # A shared library of a tree that the system doesn't know.
    set(ENV{LD_LIBRARY_PATH} ${prefix}/${LIBDIR})
endif()

run(${CMAKE_COMMAND} -E chdir ${WORK_DIR} ${program})
if(NOT output STREQUAL "/models/Default Model/parts/ROD: 1 element has no section [no-section]\nconsumer.inp: 278 bytes\n")
    message(FATAL_ERROR "the consumer wrote:\n${output}")
endif()
