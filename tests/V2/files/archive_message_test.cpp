#include "V2/archive_message.h"

#include <gtest/gtest.h>

#include "zip/exception.h"

namespace {

TEST(ArchiveMessage, HasWordsForEveryCodeOfTheEngine) {
    for (const int code :
         {100, 101, 102, 103, 104, 105, 106, 107, 108, 110, 112, 114, 115, 116, 117, 119, 120, 122,
          500, 501, 502, 503, 504, 505, 506, 507, 600, 601, 602, 603, 604, 605, 606, 607, 608, 609}) {
        EXPECT_EQ(vrl_v2::archive_message(code).find("ZIP error"), std::string::npos) << code;
        EXPECT_GT(vrl_v2::archive_message(code).size(), 10u) << code;
    }
    EXPECT_EQ(vrl_v2::archive_message(999), "ZIP error 999");
}

TEST(ArchiveMessage, TellsTheCommonFailuresApart) {
    EXPECT_NE(vrl_v2::archive_message(CZipException::badCrc).find("CRC"), std::string::npos);
    EXPECT_NE(vrl_v2::archive_message(CZipException::badPassword).find("enciphered"), std::string::npos);
    EXPECT_NE(vrl_v2::archive_message(CZipException::zip64).find("ZIP64"), std::string::npos);
}

}  // namespace
