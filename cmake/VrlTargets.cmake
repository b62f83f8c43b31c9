# How a room of the house is declared: one static library a room, strict about its own warnings.

add_library(vrl_warnings INTERFACE)
add_library(vrl::warnings ALIAS vrl_warnings)
target_compile_options(vrl_warnings INTERFACE
    $<$<CXX_COMPILER_ID:GNU,Clang>:-Wall;-Wextra;-Wpedantic;-Wconversion;-Wshadow>)

# vrl_add_room(<room> SOURCES ... [PUBLIC libs...] [PRIVATE libs...])
function(vrl_add_room room)
    cmake_parse_arguments(ARG "" "" "SOURCES;PUBLIC;PRIVATE" ${ARGN})
    add_library(vrl_${room} STATIC ${ARG_SOURCES})
    add_library(vrl::${room} ALIAS vrl_${room})
    target_compile_features(vrl_${room} PRIVATE cxx_std_20)
    target_compile_definitions(vrl_${room} PRIVATE VRL_BUILDING)
    target_include_directories(vrl_${room} PUBLIC $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}>)
    target_link_libraries(vrl_${room} PUBLIC ${ARG_PUBLIC} PRIVATE ${ARG_PRIVATE} vrl::warnings)
endfunction()

# Built once and run once: what the optimiser would gain in a test, its own work would lose.
function(vrl_build_quickly program)
    target_compile_options(${program} PRIVATE $<$<CXX_COMPILER_ID:GNU,Clang>:-O0>)
    target_precompile_headers(${program} REUSE_FROM vrl_test_headers)
endfunction()

# vrl_add_tests(<program> SOURCES ... LIBRARIES ...): a GoogleTest program whose cases ctest knows one by one.
function(vrl_add_tests program)
    cmake_parse_arguments(ARG "" "" "SOURCES;LIBRARIES" ${ARGN})
    include(GoogleTest)
    add_executable(${program} ${ARG_SOURCES})
    target_compile_features(${program} PRIVATE cxx_std_20)
    target_compile_definitions(${program} PRIVATE VRL_TEST_DATA="${PROJECT_SOURCE_DIR}/tests/data")
    target_link_libraries(${program} PRIVATE ${ARG_LIBRARIES} GTest::gtest_main vrl::warnings)
    vrl_build_quickly(${program})
    if(VRL_COVERAGE)
        # In one process: each writes the counters of all sources when it ends.
        add_test(NAME ${program} COMMAND ${program} --gtest_brief=1)
    else()
        gtest_discover_tests(${program} DISCOVERY_TIMEOUT 60)
    endif()
endfunction()
