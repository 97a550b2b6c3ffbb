# Builds the second platform set, the library on top of it, and a client of both; then runs the client.
set(prefix ${WORK_DIR}/prefix)
file(REMOVE_RECURSE ${prefix})
# A list does not survive a command line: its separators become escaped ones.
string(REPLACE ";" "\\;" launcher "${LAUNCHER}")

function(run)
    execute_process(COMMAND ${ARGN} RESULT_VARIABLE result OUTPUT_VARIABLE output ERROR_VARIABLE output)
    if(NOT result EQUAL 0)
        message("${output}")
        message(FATAL_ERROR "Ended with ${result}: ${ARGN}")
    endif()
    set(output "${output}" PARENT_SCOPE)
endfunction()

function(configure name source)
    run(${CMAKE_COMMAND} -S ${source} -B ${WORK_DIR}/${name} -G ${GENERATOR}
        -DCMAKE_BUILD_TYPE=Debug -DCMAKE_INSTALL_PREFIX=${prefix} -DCMAKE_INSTALL_LIBDIR=lib
        -DCMAKE_CXX_COMPILER=${COMPILER} "-DCMAKE_CXX_COMPILER_LAUNCHER=${launcher}" -DQt5_DIR=${QT_DIR}
        -DZelkovPlatform_DIR=${prefix}/lib/cmake/ZelkovPlatform
        -DZelkovWidgets_DIR=${prefix}/lib/cmake/ZelkovWidgets --no-warn-unused-cli ${ARGN})
endfunction()

configure(platform ${CMAKE_CURRENT_LIST_DIR}/platform)
run(${CMAKE_COMMAND} --build ${WORK_DIR}/platform --target install)

configure(library ${SOURCE_DIR} -DZELKOV_PLATFORM=external -DZELKOV_BUILD_TESTS=OFF -DZELKOV_BUILD_GALLERY=OFF
    -DZELKOV_BUILD_BENCHMARKS=OFF -DCMAKE_UNITY_BUILD=ON -DCMAKE_UNITY_BUILD_BATCH_SIZE=8)
run(${CMAKE_COMMAND} --build ${WORK_DIR}/library --target ZelkovWidgets)
run(${CMAKE_COMMAND} --install ${WORK_DIR}/library)
file(GLOB bundled ${prefix}/lib/libZelkovCore* ${prefix}/lib/libZelkovUtils*)
if(bundled)
    message(FATAL_ERROR "The bundled set was built and installed as well: ${bundled}")
endif()

configure(client ${CMAKE_CURRENT_LIST_DIR}/client)
run(${CMAKE_COMMAND} --build ${WORK_DIR}/client)
run(${WORK_DIR}/client/client)
if(NOT output STREQUAL "second set> [client] 42\nconnections through the second set: yes\n")
    message(FATAL_ERROR "The client said:\n${output}")
endif()
