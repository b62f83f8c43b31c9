#include "zip/aes_cryptograph.h"

#include <nettle/memops.h>
#include <nettle/pbkdf2.h>

#include <algorithm>

#include "zip/aes_context.h"
#include "zip/exception.h"
#include "zip/file_header.h"
#include "zip/random_pool.h"
#include "zip/storage.h"

namespace {

constexpr unsigned k_rounds = 1000;

void AddToCompressedSize(CZipFileHeader& header, std::uint32_t size) {
    header.SetCompressedSize(header.GetCompressedSize() + size);
}

}  // namespace

CZipAesCryptograph::CZipAesCryptograph(std::uint8_t method, CZipRandomPool& pool)
    : m_pool(pool), m_method(method) {
    if (!CZipEncryption::IsAes(method)) CZipException::Raise(CZipException::generic);
}

CZipAesCryptograph::~CZipAesCryptograph() = default;

bool CZipAesCryptograph::CanHandle(std::uint8_t method) const { return CZipEncryption::IsAes(method); }

std::unique_ptr<CZipAesContext> CZipAesCryptograph::MakeContext(const std::uint8_t* key) const {
    return std::make_unique<CZipAesContext>(key, CZipEncryption::AesKeySize(m_method));
}

CZipAesCryptograph::Verifier CZipAesCryptograph::DeriveKeys(const CZipAutoBuffer& password,
                                                            const Salt& salt) {
    const std::uint32_t keySize = CZipEncryption::AesKeySize(m_method);
    std::array<std::uint8_t, 2 * AES256_KEY_SIZE + CZipEncryption::aesVerifierSize> keys = {};
    pbkdf2_hmac_sha1(password.GetSize(), password.GetBuffer(), k_rounds,
                     CZipEncryption::AesSaltSize(m_method), salt.data(),
                     std::size_t{2} * keySize + CZipEncryption::aesVerifierSize, keys.data());
    m_context = MakeContext(keys.data());
    hmac_sha1_set_key(&m_authentication, keySize, keys.data() + keySize);
    Verifier verifier;
    std::copy_n(keys.data() + std::size_t{2} * keySize, verifier.size(), verifier.begin());
    return verifier;
}

void CZipAesCryptograph::BeginEncode(const CZipAutoBuffer& password, CZipFileHeader& header,
                                     CZipStorage& storage) {
    m_method = header.GetEncryptionMethod();
    const std::uint32_t saltSize = CZipEncryption::AesSaltSize(m_method);
    Salt salt = {};
    m_pool.Read(salt.data(), saltSize);
    const Verifier verifier = DeriveKeys(password, salt);
    storage.Write(salt.data(), saltSize, false);
    storage.Write(verifier.data(), verifier.size(), false);
    AddToCompressedSize(header, saltSize + CZipEncryption::aesVerifierSize);
}

bool CZipAesCryptograph::BeginDecode(const CZipAutoBuffer& password, CZipFileHeader& header,
                                     CZipStorage& storage) {
    m_method = header.GetEncryptionMethod();
    Salt salt = {};
    storage.Read(salt.data(), CZipEncryption::AesSaltSize(m_method), false);
    Verifier stored;
    storage.Read(stored.data(), stored.size(), false);
    return DeriveKeys(password, salt) == stored;
}

void CZipAesCryptograph::Encode(std::uint8_t* buffer, std::uint32_t size) {
    m_context->Apply(buffer, size);
    hmac_sha1_update(&m_authentication, size, buffer);
}

void CZipAesCryptograph::Decode(std::uint8_t* buffer, std::uint32_t size) {
    hmac_sha1_update(&m_authentication, size, buffer);
    m_context->Apply(buffer, size);
}

CZipAesCryptograph::Authentication CZipAesCryptograph::FinishAuthentication() {
    Authentication code;
    hmac_sha1_digest(&m_authentication, code.size(), code.data());
    return code;
}

void CZipAesCryptograph::EndEncode(CZipFileHeader& header, CZipStorage& storage) {
    const Authentication code = FinishAuthentication();
    storage.Write(code.data(), code.size(), false);
    AddToCompressedSize(header, CZipEncryption::aesAuthenticationSize);
}

void CZipAesCryptograph::EndDecode(CZipFileHeader& /*header*/, CZipStorage& storage) {
    Authentication stored;
    storage.Read(stored.data(), stored.size(), false);
    const Authentication code = FinishAuthentication();
    if (memeql_sec(stored.data(), code.data(), code.size()) == 0)
        CZipException::Raise(CZipException::badAuthentication, storage.GetFilePath());
}
