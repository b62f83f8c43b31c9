# How a build watches itself: sanitizers and coverage. Include this before the first target, so that it holds
# for all of them; it stays inside this build and reaches nobody who links the library.

set(VRL_SANITIZE "" CACHE STRING "Sanitizers for every target, e.g. address,undefined or thread")
option(VRL_COVERAGE "Count the lines that run (g++, gcov)" OFF)

set(vrl_sanitizers ${VRL_SANITIZE})
if(VRL_BUILD_FUZZ)
    if(NOT CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
        message(FATAL_ERROR "VRL_BUILD_FUZZ needs clang++: pass -DCMAKE_CXX_COMPILER=clang++ -DCMAKE_C_COMPILER=clang")
    endif()
    # libFuzzer steers by the counters that this puts into every room.
    list(APPEND vrl_sanitizers fuzzer-no-link)
endif()
list(JOIN vrl_sanitizers "," vrl_sanitizers)

# In the language's own flags, since the consumer test hands those on to a program outside the tree, which
# has to bring the sanitizer's runtime along.
if(vrl_sanitizers)
    string(APPEND CMAKE_C_FLAGS " -fsanitize=${vrl_sanitizers} -fno-sanitize-recover=all -fno-omit-frame-pointer")
    string(APPEND CMAKE_CXX_FLAGS " -fsanitize=${vrl_sanitizers} -fno-sanitize-recover=all -fno-omit-frame-pointer")
endif()
if(VRL_COVERAGE)
    string(APPEND CMAKE_C_FLAGS " --coverage")
    string(APPEND CMAKE_CXX_FLAGS " --coverage -fprofile-update=atomic")
endif()
