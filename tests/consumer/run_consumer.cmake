file(REMOVE_RECURSE "${BINARY}")
execute_process(COMMAND ${CMAKE_COMMAND} -S "${SOURCE}" -B "${BINARY}" -G "${GENERATOR}"
                        "-DCMAKE_PREFIX_PATH=${PREFIX}"
                        "-DCMAKE_CXX_FLAGS=${FLAGS}"
                        "-DCMAKE_EXE_LINKER_FLAGS=${FLAGS}"
                RESULT_VARIABLE rc)
if(rc)
    message(FATAL_ERROR "consumer: configure failed against ${PREFIX} (run 'cmake --install' first)")
endif()
execute_process(COMMAND ${CMAKE_COMMAND} --build "${BINARY}" RESULT_VARIABLE rc)
if(rc)
    message(FATAL_ERROR "consumer: build failed")
endif()
execute_process(COMMAND "${BINARY}/vexa-consumer" RESULT_VARIABLE rc OUTPUT_VARIABLE out)
message(STATUS "${out}")
if(rc)
    message(FATAL_ERROR "consumer: run failed (${rc})")
endif()
