#include "zip/encryption.h"

#include "zip/exception.h"

namespace CZipEncryption {

std::uint32_t HeaderSize(std::uint8_t method) {
    if (method == none) return 0;
    if (method == traditional) return traditionalHeaderSize;
    if (IsAes(method)) return AesSaltSize(method) + aesVerifierSize;
    CZipException::Raise(CZipException::generic);
}

std::uint32_t Overhead(std::uint8_t method) {
    return HeaderSize(method) + (IsAes(method) ? aesAuthenticationSize : 0);
}

}  // namespace CZipEncryption
