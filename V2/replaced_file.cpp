#include "V2/replaced_file.h"

#include <utility>

#include "V2/file_outcome.h"

namespace vrl_v2 {

replaced_file::replaced_file(const std::filesystem::path& target, const file_access& access)
    : m_access(access), m_file(access.exchange.create_beside(target)), m_pending(m_file.descriptor >= 0) {
    if (!m_pending) m_problem = failed_opening("cannot be saved", m_file.error);
}

replaced_file::~replaced_file() {
    if (!m_pending) return;
    close();
    m_access.exchange.remove(m_file.path);
}

int replaced_file::close() {
    if (m_file.descriptor < 0) return 0;
    const auto closed = m_access.files.close(std::exchange(m_file.descriptor, -1));
    return closed.value < 0 ? closed.error : 0;
}

int replaced_file::flush_and_close() {
    const auto flushed = m_access.files.commit(m_file.descriptor);
    const int error = close();
    return flushed.value < 0 ? flushed.error : error;
}

file_outcome replaced_file::commit() {
    if (const int error = flush_and_close()) return failed_call("writing failed", error);
    if (const int error = m_access.exchange.replace(m_file.path, m_file.target))
        return failed_call("the saved file cannot take its place", error);
    m_pending = false;
    if (const int error = m_access.exchange.commit_folder(m_file.folder))
        return failed_call(
            "saved, but the folder cannot be flushed: after a power cut the old file may be back", error);
    return {};
}

}  // namespace vrl_v2
