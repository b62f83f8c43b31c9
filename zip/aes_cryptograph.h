#pragma once

#include <nettle/hmac.h>

#include <array>
#include <memory>

#include "zip/cryptograph.h"
#include "zip/encryption.h"

class CZipRandomPool;

/// Produces the key stream of one key, block by block.
class CZipAesContext;

/// AES in counter mode with HMAC-SHA1 over the enciphered bytes.
///
/// Keys     PBKDF2 with HMAC-SHA1, 1000 rounds: the AES key, the HMAC key, two bytes that verify the
/// password. Source   the WinZip AES specification (AE-1, AE-2); RFC 2898, RFC 2104, FIPS 197.
class CZipAesCryptograph : public CZipCryptograph {
public:
    /// 100 for a method that is not AES. The pool must outlive this object.
    CZipAesCryptograph(std::uint8_t method, CZipRandomPool& pool);
    ~CZipAesCryptograph() override;

    /// Checks two bytes: a wrong password passes once in 65536 times, and shows at the end then.
    bool BeginDecode(const CZipAutoBuffer& password, CZipFileHeader& header, CZipStorage& storage) override;
    void BeginEncode(const CZipAutoBuffer& password, CZipFileHeader& header, CZipStorage& storage) override;
    void Decode(std::uint8_t* buffer, std::uint32_t size) override;
    void Encode(std::uint8_t* buffer, std::uint32_t size) override;
    /// 119 when the authentication code is another.
    void EndDecode(CZipFileHeader& header, CZipStorage& storage) override;
    void EndEncode(CZipFileHeader& header, CZipStorage& storage) override;
    bool CanHandle(std::uint8_t method) const override;
    virtual std::unique_ptr<CZipAesContext> MakeContext(const std::uint8_t* key) const;

private:
    using Verifier = std::array<std::uint8_t, CZipEncryption::aesVerifierSize>;
    using Authentication = std::array<std::uint8_t, CZipEncryption::aesAuthenticationSize>;
    using Salt = std::array<std::uint8_t, 16>;

    Verifier DeriveKeys(const CZipAutoBuffer& password, const Salt& salt);
    Authentication FinishAuthentication();

    CZipRandomPool& m_pool;
    std::unique_ptr<CZipAesContext> m_context;
    std::uint8_t m_method;
    hmac_sha1_ctx m_authentication = {};
};
