cmake_minimum_required(VERSION 3.25)
# Installs the build into an empty prefix, then builds and runs the consumer through both package systems.
function(run)
    execute_process(COMMAND ${ARGN} RESULT_VARIABLE result OUTPUT_VARIABLE output ERROR_VARIABLE output)
    if(NOT result EQUAL 0)
        list(JOIN ARGN " " command)
        message(FATAL_ERROR "${command}\nended with ${result}:\n${output}")
    endif()
endfunction()

file(REMOVE_RECURSE ${VRL_WORK})
set(prefix ${VRL_WORK}/prefix)
run(${CMAKE_COMMAND} --install ${VRL_BUILD} --prefix ${prefix})

run(${CMAKE_COMMAND} -S ${VRL_CONSUMER} -B ${VRL_WORK}/by-cmake -DCMAKE_PREFIX_PATH=${prefix}
    -DCMAKE_CXX_COMPILER=${VRL_CXX} "-DCMAKE_CXX_FLAGS=${VRL_CXX_FLAGS}")
run(${CMAKE_COMMAND} --build ${VRL_WORK}/by-cmake)
run(${VRL_WORK}/by-cmake/consumer)

set(ENV{PKG_CONFIG_PATH} ${prefix}/${VRL_LIBDIR}/pkgconfig)
execute_process(COMMAND pkg-config --cflags --libs vrl OUTPUT_VARIABLE flags
    OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)
separate_arguments(flags UNIX_COMMAND "${VRL_CXX_FLAGS} ${flags}")
run(${VRL_CXX} -std=c++17 ${VRL_CONSUMER}/consumer.cpp -o ${VRL_WORK}/by-pkg-config ${flags})
set(ENV{LD_LIBRARY_PATH} ${prefix}/${VRL_LIBDIR})
run(${VRL_WORK}/by-pkg-config)
