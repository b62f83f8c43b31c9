#include "zip/exception.h"

void CZipException::Raise(int code, const std::string& path) { throw CZipException(code, path); }
