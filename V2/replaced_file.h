#pragma once

#include "V2/document_file.h"
#include "V2/file_access.h"

namespace vrl_v2 {

/// A file that is written beside its target and takes its place when it is whole. Until then, and when
/// anything fails, the target is what it was; what is not committed goes away again.
class replaced_file {
public:
    /// Makes the new file. Borrows the access.
    replaced_file(const std::filesystem::path& target, const file_access& access);
    replaced_file(const replaced_file&) = delete;
    replaced_file& operator=(const replaced_file&) = delete;
    ~replaced_file();

    /// No failure if there is a file to write to.
    const file_outcome& problem() const { return m_problem; }
    int descriptor() const { return m_file.descriptor; }
    /// Flushes, closes, replaces, flushes the folder.
    file_outcome commit();

private:
    int flush_and_close();
    int close();

    const file_access& m_access;
    vrl_platform::replacement m_file;
    bool m_pending = false;
    file_outcome m_problem;
};

}  // namespace vrl_v2
