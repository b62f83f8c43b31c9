#pragma once

#include <new>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "zip/exception.h"

namespace ZipArchiveLib {

/// Appends to one of the engine's vectors; CZipException 122 with this path when it does not grow.
template <class T>
T& PushBack(std::vector<T>& vector, T value, const std::string& path = {}) {
    try {
        vector.push_back(std::move(value));
    } catch (const std::bad_alloc&) {
        CZipException::Raise(CZipException::vectorNotGrown, path);
    } catch (const std::length_error&) {
        CZipException::Raise(CZipException::vectorNotGrown, path);
    }
    return vector.back();
}

}  // namespace ZipArchiveLib
