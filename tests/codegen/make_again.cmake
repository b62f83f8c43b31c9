cmake_minimum_required(VERSION 3.25)
# The schema compiled anew into an empty folder gives what the build has, file by file: nothing in it hangs on the
# order of a table in memory or on what was there before.
file(REMOVE_RECURSE ${VRL_WORK})
execute_process(COMMAND ${VRL_CODEGEN} ${VRL_SCHEMA} ${VRL_WORK} COMMAND_ERROR_IS_FATAL ANY)
file(GLOB_RECURSE made RELATIVE ${VRL_WORK} ${VRL_WORK}/*)
list(LENGTH made count)
if(count LESS 40)
    message(FATAL_ERROR "only ${count} files were made")
endif()
foreach(file IN LISTS made)
    execute_process(COMMAND ${CMAKE_COMMAND} -E compare_files ${VRL_WORK}/${file} ${VRL_GENERATED}/${file}
        RESULT_VARIABLE differs)
    if(differs)
        message(SEND_ERROR "differs from what the build has: ${file}")
    endif()
endforeach()
