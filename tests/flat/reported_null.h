#pragma once

#include <gtest/gtest.h>

#include <string>

#include "flat/vrl_flat.h"

/// What the argument callback was last called with, and how often.
namespace vrl_flat_driver {

struct reported_null {
    std::string message;
    int calls = 0;
};
inline reported_null g_reported;

inline void take_message(const char* message, const char* parameter) {
    EXPECT_EQ(parameter, nullptr);
    g_reported.message = message;
    ++g_reported.calls;
}

inline void listen_for_nulls() {
    SWIGRegisterExceptionArgumentCallbacks_VrlModule(nullptr, &take_message, nullptr);
    g_reported = {};
}

/// Since the last question this was reported, once, and nothing else.
inline void expect_message(const std::string& text) {
    EXPECT_EQ(g_reported.calls, 1) << text;
    EXPECT_EQ(g_reported.message, text);
    g_reported = {};
}

inline void expect_no_message() {
    EXPECT_EQ(g_reported.calls, 0) << g_reported.message;
    g_reported = {};
}

}  // namespace vrl_flat_driver
