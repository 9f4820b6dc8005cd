# Installs the build into an empty folder and builds the consumer from there.
foreach(variable IN ITEMS BUILD SOURCE PREFIX CONSUMER LIBDIR)
    if(NOT ${variable})
        message(FATAL_ERROR "${variable} is not given")
    endif()
endforeach()

function(run)
    execute_process(COMMAND ${ARGV} COMMAND_ERROR_IS_FATAL ANY)
endfunction()

file(REMOVE_RECURSE "${PREFIX}")
run(${CMAKE_COMMAND} --install "${BUILD}" --prefix "${PREFIX}")
run(${PYTHON} "${SOURCE}/tests/product/extractcode.py" "${CONSUMER}/code" "${SOURCE}/README.md"
    "${SOURCE}/docs/EMBEDDING.md")
run(${CMAKE_COMMAND} -S "${SOURCE}/tests/product/consumer" -B "${CONSUMER}" -G Ninja
    -DCMAKE_BUILD_TYPE=Debug
    "-DCMAKE_CXX_FLAGS=-Wall -Wextra -Wpedantic -Werror"
    "-DCMAKE_CXX_COMPILER=${COMPILER}"
    "-DCMAKE_CXX_COMPILER_LAUNCHER=${LAUNCHER}"
    "-DCMAKE_PREFIX_PATH=${PREFIX}"
    "-DFAVRIN_PREFIX=${PREFIX}"
    "-DFAVRIN_LIBDIR=${LIBDIR}"
    "-DFAVRIN_SOURCE=${SOURCE}"
    "-DFAVRIN_CODE=${CONSUMER}/code")
run(${CMAKE_COMMAND} --build "${CONSUMER}")
