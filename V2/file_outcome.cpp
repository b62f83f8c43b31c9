#include "V2/file_outcome.h"

#include <cerrno>
#include <system_error>

#include "V2/archive_message.h"
#include "platform/file_exchange.h"
#include "zip/exception.h"

namespace vrl_v2 {
namespace {

qbxV2::eqbx_error code_of(file_failure failure) {
    switch (failure) {
        case file_failure::none:
            return qbxV2::EQBX_NO_ERROR;
        case file_failure::missing:
        case file_failure::not_opened:
            return qbxV2::EQBX_FILE_NOT_OPENED;
        case file_failure::bad_archive:
            return qbxV2::EQBX_USER_ERROR_1;
        case file_failure::unknown_format:
            return qbxV2::EQBX_USER_ERROR_2;
        case file_failure::system_error:
            return qbxV2::EQBX_USER_ERROR_3;
        case file_failure::limit_exceeded:
            return qbxV2::EQBX_USER_ERROR_4;
        case file_failure::cancelled:
            return qbxV2::EQBX_USER_ERROR_5;
        case file_failure::bad_document:
            break;
    }
    return qbxV2::EQBX_UNDEFINED_ERROR;
}

std::string system_words(int error) {
    if (error == EISDIR) return "it is a folder";
    if (error == EINVAL) return "it is neither a file nor a folder";
    return std::generic_category().message(error);
}

}  // namespace

file_outcome failed(file_failure failure, const std::string& what) {
    file_outcome outcome;
    outcome.failure = failure;
    outcome.code = code_of(failure);
    outcome.message = what;
    return outcome;
}

file_outcome failed_call(const std::string& what, int error) {
    return failed(file_failure::system_error, what + ": " + std::generic_category().message(error));
}

file_outcome failed_opening(const std::string& what, int error) {
    const file_failure failure = error == ENOENT ? file_failure::missing : file_failure::not_opened;
    return failed(failure, what + ": " + system_words(error));
}

file_outcome failed_archive(const std::string& what, int code) {
    if (code == EFBIG) {
        return failed(file_failure::limit_exceeded, what + ": a packed file can hold 4 GB at most");
    }
    const bool is_memory = code == CZipException::vectorNotGrown || code == CZipException::zlibMemory ||
                           code == CZipException::bzip2Memory;
    return failed(is_memory ? file_failure::system_error : file_failure::bad_archive,
                  what + ": " + archive_message(code));
}

void place(file_outcome& outcome, const std::string& name) {
    if (outcome) return;
    std::string where = name;
    if (outcome.line > 0) {
        if (!where.empty()) where += ", ";
        where += "line " + std::to_string(outcome.line);
    }
    if (!where.empty()) outcome.message = where + ": " + outcome.message;
}

std::filesystem::path path_from_wide(const std::wstring& path) { return vrl_platform::path_from_wide(path); }

std::string as_text(const std::filesystem::path& path) {
    const auto text = path.u8string();
    return {reinterpret_cast<const char*>(text.data()), text.size()};
}

}  // namespace vrl_v2
