cmake_minimum_required(VERSION 3.25)
# Everything that the library exports has a name of its own: the two namespaces and the flat layer.
# What a compiler emits for templates of the standard library is weak, and is every program's own; the address
# sanitizer, where a build has it, marks each exported variable.
execute_process(COMMAND ${VRL_NM} -D --defined-only -C ${VRL_LIBRARY} OUTPUT_VARIABLE symbols
    COMMAND_ERROR_IS_FATAL ANY)
string(REGEX REPLACE "\n" ";" symbols "${symbols}")
set(count 0)
foreach(symbol IN LISTS symbols)
    if(symbol MATCHES "^[0-9a-f]+ [TDBR] (.*)$")
        math(EXPR count "${count} + 1")
        if(NOT CMAKE_MATCH_1 MATCHES "vrl_v2::|qbxV2::|^CSharp_|^SWIGRegister|^__odr_asan[.]|^vrl_[a-z_]+$")
            message(SEND_ERROR "exported: ${CMAKE_MATCH_1}")
        endif()
    endif()
endforeach()
if(count LESS 1000)
    message(SEND_ERROR "only ${count} names are exported")
endif()
message(STATUS "${count} names are exported")
