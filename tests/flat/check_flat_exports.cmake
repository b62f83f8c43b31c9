cmake_minimum_required(VERSION 3.25)
# The list of exports against the library's symbols, both ways, and the counts that callers were told.
execute_process(COMMAND ${VRL_NM} -D --defined-only ${VRL_LIBRARY} OUTPUT_VARIABLE symbols
    COMMAND_ERROR_IS_FATAL ANY)
# Of any kind: a weak or a data symbol with the prefix would be one too many.
string(REGEX MATCHALL " [A-Za-z] CSharp_[A-Za-z0-9_]+" exported "${symbols}")
list(TRANSFORM exported REPLACE " [A-Za-z] " "")
list(SORT exported)
file(STRINGS ${VRL_EXPORTS} lines)
set(listed ${lines})
list(FILTER listed INCLUDE REGEX "^CSharp_")
list(SORT listed)

set(missing ${listed})
list(REMOVE_ITEM missing ${exported})
set(unlisted ${exported})
list(REMOVE_ITEM unlisted ${listed})
if(missing OR unlisted)
    message(SEND_ERROR "missing: ${missing}\nnot listed: ${unlisted}")
endif()
list(LENGTH exported count)
if(NOT count EQUAL 3731)
    message(SEND_ERROR "${count} exports, expected 3731")
endif()
foreach(name SWIGRegisterExceptionCallbacks_VrlModule SWIGRegisterExceptionArgumentCallbacks_VrlModule
        SWIGRegisterStringCallback_VrlModule vrl_free_string vrl_set_string_prefix vrl_revision_any)
    if(NOT symbols MATCHES " T ${name}\n")
        message(SEND_ERROR "${name} is not exported")
    endif()
endforeach()
foreach(name new_c_big_int__SWIG_3 new_c_decimal__SWIG_3)
    if(symbols MATCHES "CSharp_${name}\n")
        message(SEND_ERROR "CSharp_${name} is exported")
    endif()
endforeach()

foreach(told "410 new" "222 delete" "133 Upcast" "145 swap" "142 reset" "142 is_occurs_ok" "204 get_object"
        "204 assign" "154 isset" "154 unset" "36 getenum" "36 setenum" "11 getchosen" "12 isnil" "12 setnil"
        "62 size" "62 append" "62 insert" "62 delete_entry" "62 clear" "48 back" "68 marshal" "136 unmarshal"
        "68 clone" "68 getid" "68 has_id" "68 id_get" "68 id_set" "7 factory" "3731 in all")
    if(NOT "# ${told}" IN_LIST lines)
        message(SEND_ERROR "exports.txt does not say '${told}'")
    endif()
endforeach()
