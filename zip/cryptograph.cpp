#include "zip/cryptograph.h"

void CZipCryptograph::EndDecode(CZipFileHeader& /*header*/, CZipStorage& /*storage*/) {}
void CZipCryptograph::EndEncode(CZipFileHeader& /*header*/, CZipStorage& /*storage*/) {}
bool CZipCryptograph::CanHandle(std::uint8_t /*method*/) const { return false; }
