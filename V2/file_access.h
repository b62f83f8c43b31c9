#pragma once

#include "V2/document_file.h"
#include "platform/file_descriptors.h"
#include "platform/file_exchange.h"

namespace vrl_v2 {

/// The files that loading and saving work on. Whoever wants others (failing ones) passes his own; they must
/// outlive the call.
struct file_access {
    vrl_platform::file_descriptors& files;
    vrl_platform::file_exchange& exchange;

    static const file_access& system();
};

load_result load_document(const std::filesystem::path& path, const load_options& options,
                          const file_access& access);
save_result save_document(const Vrl& document, const std::filesystem::path& path, const save_options& options,
                          const file_access& access);

}  // namespace vrl_v2
