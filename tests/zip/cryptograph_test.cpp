#include "zip/cryptograph.h"

#include <gtest/gtest.h>

#include <zlib.h>

#include "platform/c_random.h"
#include "raw_archive.h"
#include "zip/aes_context.h"
#include "zip/aes_cryptograph.h"
#include "zip/crc32_cryptograph.h"
#include "zip/file_header.h"
#include "zip/mem_file.h"
#include "zip/storage.h"

namespace {

using zip_test::Bytes;
using zip_test::CodeOf;
using zip_test::World;

CZipAutoBuffer Password(const Bytes& text) {
    CZipAutoBuffer buffer;
    buffer.Assign(text.data(), static_cast<std::uint32_t>(text.size()));
    return buffer;
}

struct Sizes {
    int method;
    std::uint32_t header;
    std::uint32_t overhead;
};
void PrintTo(const Sizes& c, std::ostream* os) { *os << c.method; }

class EncryptionSizes : public testing::TestWithParam<Sizes> {};
TEST_P(EncryptionSizes, Are) {
    const auto method = static_cast<std::uint8_t>(GetParam().method);
    EXPECT_EQ(CZipEncryption::HeaderSize(method), GetParam().header);
    EXPECT_EQ(CZipEncryption::Overhead(method), GetParam().overhead);
}
INSTANTIATE_TEST_SUITE_P(Methods, EncryptionSizes,
                         testing::Values(Sizes{255, 0, 0}, Sizes{0, 12, 12}, Sizes{1, 10, 20},
                                         Sizes{2, 14, 24}, Sizes{3, 18, 28}));

TEST(EncryptionSizes, OfWhatIsNoMethodRaise100) {
    for (const int method : {4, 5, 99, 254}) {
        EXPECT_EQ(CodeOf([&] { CZipEncryption::HeaderSize(static_cast<std::uint8_t>(method)); }), 100);
        EXPECT_EQ(CodeOf([&] { CZipEncryption::Overhead(static_cast<std::uint8_t>(method)); }), 100);
    }
}

class Ciphers : public testing::Test {
protected:
    World world;
    CZipMemFile file;
    CZipStorage storage{world.environment};
    CZipFileHeader header;

    void SetUp() override { storage.Open(file, CZipStorage::create); }
    Bytes Written() {
        storage.Flush();
        return {reinterpret_cast<const char*>(file.GetData()), file.GetLength()};
    }
    Bytes Encode(CZipCryptograph& cryptograph, Bytes data, const Bytes& password) {
        cryptograph.BeginEncode(Password(password), header, storage);
        cryptograph.Encode(reinterpret_cast<std::uint8_t*>(data.data()),
                           static_cast<std::uint32_t>(data.size()));
        storage.Write(data.data(), static_cast<std::uint32_t>(data.size()), false);
        cryptograph.EndEncode(header, storage);
        return Written();
    }
    Bytes Decode(CZipCryptograph& cryptograph, std::size_t size) {
        Bytes data(size, '\0');
        storage.Read(data.data(), static_cast<std::uint32_t>(size), false);
        cryptograph.Decode(reinterpret_cast<std::uint8_t*>(data.data()), static_cast<std::uint32_t>(size));
        return data;
    }
};

class Traditional : public Ciphers {
protected:
    CZipCrc32Cryptograph cryptograph{world.clock};

    void SetUp() override {
        Ciphers::SetUp();
        header.SetEncryptionMethod(CZipEncryption::traditional);
        header.SetTime(1700000000);
        header.Prepare(-1, false);
    }
};

TEST_F(Traditional, HandlesMethod0Alone) {
    EXPECT_TRUE(cryptograph.CanHandle(0));
    for (const int method : {1, 2, 3, 255})
        EXPECT_FALSE(cryptograph.CanHandle(static_cast<std::uint8_t>(method)));
}

TEST_F(Traditional, DecodesWhatItEncodes) {
    const Bytes written = Encode(cryptograph, "some text", "password");
    EXPECT_EQ(written.size(), 21U);
    EXPECT_EQ(header.GetCompressedSize(), 12U) << "the compressor adds the rest";
    EXPECT_EQ(written.find("some"), Bytes::npos);
    storage.Seek(0);
    ASSERT_TRUE(cryptograph.BeginDecode(Password("password"), header, storage));
    EXPECT_EQ(Decode(cryptograph, 9), "some text");
}

// The scheme as APPNOTE 6.1.5 to 6.1.7 tell it, byte by byte.
Bytes Deciphered(const Bytes& bytes, const Bytes& password) {
    std::uint32_t keys[3] = {0x12345678, 0x23456789, 0x34567890};
    const auto step = [](std::uint32_t crc, std::uint8_t byte) {
        return ~static_cast<std::uint32_t>(crc32(~crc, &byte, 1));
    };
    const auto update = [&](std::uint8_t byte) {
        keys[0] = step(keys[0], byte);
        keys[1] = (keys[1] + (keys[0] & 0xFF)) * 134775813U + 1;
        keys[2] = step(keys[2], static_cast<std::uint8_t>(keys[1] >> 24));
    };
    for (const char c : password) update(static_cast<std::uint8_t>(c));
    Bytes plain;
    for (const char c : bytes) {
        const std::uint32_t low = (keys[2] & 0xFFFF) | 2;
        const auto byte = static_cast<std::uint8_t>(static_cast<std::uint8_t>(c) ^ ((low * (low ^ 1)) >> 8));
        update(byte);
        plain.push_back(static_cast<char>(byte));
    }
    return plain;
}

TEST_F(Traditional, TheHeaderIsTenRandomBytesAndTheTime) {
    // A second in which a value occurs whose shifted byte is 0, and one in which none does.
    bool withZero = false;
    bool without = false;
    for (; !withZero || !without; ++world.clock.time) {
        vrl_platform::c_random random(world.clock.time);
        Bytes expected;
        bool hasZero = false;
        for (int i = 0; i < 10; ++i) {
            const unsigned drawn = random.next();
            const bool isZero = ((drawn >> 6) & 0xFF) == 0;
            hasZero = hasZero || isZero;
            expected.push_back(static_cast<char>(isZero ? drawn & 0xFF : (drawn >> 6) & 0xFF));
        }
        (hasZero ? withZero : without) = true;
        file.SetLength(0);
        const Bytes plain = Deciphered(Encode(cryptograph, "data", "password"), "password");
        EXPECT_EQ(plain, expected + zip_test::Number16(header.GetModificationTime()) + "data");
    }
}

TEST_F(Traditional, TwoEntriesOfOneSecondHaveTheSameRandomBytes) {
    const Bytes first = Encode(cryptograph, "", "password");
    file.SetLength(0);
    EXPECT_EQ(Encode(cryptograph, "", "password"), first);
    file.SetLength(0);
    ++world.clock.time;
    EXPECT_NE(Encode(cryptograph, "", "password"), first);
}

TEST_F(Traditional, AWrongPasswordIsFoundInAllButOneCaseOf256) {
    Encode(cryptograph, "", "password");
    int passed = 0;
    for (int i = 0; i < 2560; ++i) {
        storage.Seek(0);
        if (cryptograph.BeginDecode(Password("wrong" + std::to_string(i)), header, storage)) ++passed;
    }
    EXPECT_GT(passed, 0);
    EXPECT_LT(passed, 40);
}

TEST_F(Traditional, WithoutADescriptorTheHighByteOfTheCrcIsCompared) {
    Encode(cryptograph, "", "password");
    header.SetFlags(1);
    int passing = -1;
    for (int high = 0; high < 256; ++high) {
        header.SetCrc(static_cast<std::uint32_t>(high) << 24);
        storage.Seek(0);
        if (!cryptograph.BeginDecode(Password("password"), header, storage)) continue;
        EXPECT_EQ(passing, -1);
        passing = high;
    }
    EXPECT_EQ(passing, header.GetModificationTime() >> 8);
}

class Aes : public Ciphers, public testing::WithParamInterface<int> {
protected:
    std::uint8_t Method() const { return static_cast<std::uint8_t>(GetParam()); }
    CZipAesCryptograph cryptograph{static_cast<std::uint8_t>(GetParam()), world.pool};

    void SetUp() override {
        Ciphers::SetUp();
        header.SetEncryptionMethod(Method());
    }
};

TEST_P(Aes, HandlesAllThreeStrengths) {
    for (const int method : {1, 2, 3}) EXPECT_TRUE(cryptograph.CanHandle(static_cast<std::uint8_t>(method)));
    EXPECT_FALSE(cryptograph.CanHandle(0));
    EXPECT_FALSE(cryptograph.CanHandle(255));
    EXPECT_FALSE(cryptograph.CanHandle(4));
}

TEST_P(Aes, DecodesWhatItEncodes) {
    const Bytes data = zip_test::Noise(5000);
    const Bytes written = Encode(cryptograph, data, "password");
    EXPECT_EQ(written.size(), data.size() + CZipEncryption::Overhead(Method()));
    EXPECT_EQ(header.GetCompressedSize(), CZipEncryption::Overhead(Method()))
        << "the compressor adds the rest";
    storage.Seek(0);
    ASSERT_TRUE(cryptograph.BeginDecode(Password("password"), header, storage));
    // In pieces that do not fit blocks.
    Bytes all;
    for (const std::size_t size : {7U, 1026U, 3967U}) all += Decode(cryptograph, size);
    EXPECT_TRUE(all == data);
    EXPECT_EQ(CodeOf([&] { cryptograph.EndDecode(header, storage); }), 0);
}

TEST_P(Aes, AWrongPasswordGivesFalse) {
    Encode(cryptograph, "", "password");
    for (const char* wrong : {"passwore", "Password", "p", "password "}) {
        storage.Seek(0);
        EXPECT_FALSE(cryptograph.BeginDecode(Password(wrong), header, storage)) << wrong;
    }
}

TEST_P(Aes, AChangedByteOfDataOrCodeRaises119) {
    const Bytes written = Encode(cryptograph, "0123456789", "password");
    const std::size_t first = CZipEncryption::HeaderSize(Method());
    for (std::size_t at = first; at < written.size(); ++at) {
        Bytes damaged = written;
        damaged[at] = static_cast<char>(damaged[at] ^ 1);
        file.SetLength(0);
        file.Write(damaged.data(), static_cast<std::uint32_t>(damaged.size()));
        storage.Seek(0);
        ASSERT_TRUE(cryptograph.BeginDecode(Password("password"), header, storage));
        Decode(cryptograph, 10);
        EXPECT_EQ(CodeOf([&] { cryptograph.EndDecode(header, storage); }), 119) << at;
    }
}

TEST_P(Aes, SaltsDifferFromEntryToEntry) {
    const Bytes first = Encode(cryptograph, "", "password");
    file.SetLength(0);
    EXPECT_NE(Encode(cryptograph, "", "password"), first);
}

INSTANTIATE_TEST_SUITE_P(Strengths, Aes, testing::Values(1, 2, 3));

TEST(AesCryptograph, OfAMethodThatIsNotAesRaises100) {
    World world;
    for (const int method : {0, 4, 255})
        EXPECT_EQ(CodeOf([&] { CZipAesCryptograph(static_cast<std::uint8_t>(method), world.pool); }), 100);
}

TEST(AesContext, CountsFromOneWithTheLowByteFirst) {
    const std::uint8_t key[32] = {};
    CZipAesContext whole(key, 16);
    std::uint8_t stream[64] = {};
    whole.Apply(stream, sizeof stream);
    aes128_ctx reference;
    aes128_set_encrypt_key(&reference, key);
    for (std::uint8_t block = 0; block < 4; ++block) {
        std::uint8_t counter[16] = {static_cast<std::uint8_t>(block + 1)};
        std::uint8_t expected[16];
        aes128_encrypt(&reference, 16, expected, counter);
        EXPECT_EQ(Bytes(reinterpret_cast<char*>(stream) + 16 * block, 16),
                  Bytes(reinterpret_cast<char*>(expected), 16));
    }
}

TEST(AesContext, CarriesIntoTheSecondByteOfTheCounter) {
    const std::uint8_t key[32] = {};
    CZipAesContext context(key, 32);
    Bytes stream(16 * 260, '\0');
    context.Apply(reinterpret_cast<std::uint8_t*>(stream.data()), stream.size());
    aes256_ctx reference;
    aes256_set_encrypt_key(&reference, key);
    const std::uint8_t counter[16] = {0x01, 0x01};
    std::uint8_t expected[16];
    aes256_encrypt(&reference, 16, expected, counter);
    EXPECT_EQ(stream.substr(16 * 256, 16), Bytes(reinterpret_cast<char*>(expected), 16));
}

}  // namespace
