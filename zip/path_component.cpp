#include "zip/path_component.h"

#include <cctype>
#include <utility>

namespace {

// Room for a terminator included, as in the calls that the limits come from.
constexpr std::size_t k_partSize = 256;

std::string Joined(const std::string& first, const std::string& second, char separator) {
    if (first.empty()) return second;
    if (second.empty()) return first;
    return first + separator + second;
}

}  // namespace

std::size_t CZipPathComponent::PrefixLength(const std::string& path) const {
    static constexpr char longest[] = "\\\\?\\unc\\";
    std::size_t matched = 0;
    if (m_separator == definedSeparator) {
        while (matched < sizeof longest - 1 && matched < path.size() &&
               std::tolower(static_cast<unsigned char>(path[matched])) == longest[matched])
            ++matched;
        return matched == 2 || matched == 4 || matched == 8 ? matched : 0;
    }
    while (matched < path.size() && path[matched] == m_separator) ++matched;
    return matched;
}

bool CZipPathComponent::IsSeparator(char c) const {
    return c == m_separator || (m_separator == definedSeparator && c == '/');
}

void CZipPathComponent::SetFullPath(const std::string& path) {
    const std::size_t prefix = PrefixLength(path);
    m_prefix = path.substr(0, prefix);
    Split(path.substr(prefix));
}

void CZipPathComponent::Split(const std::string& path) {
    const bool limited = m_separator == definedSeparator;
    m_drive.clear();
    if (limited && path.size() >= 2 && path[1] == ':') m_drive = path.substr(0, 2);
    std::size_t name = path.size();
    while (name > m_drive.size() && !IsSeparator(path[name - 1])) --name;
    std::size_t dot = path.rfind('.');
    if (dot == std::string::npos || dot < name) dot = path.size();

    m_directory = path.substr(m_drive.size(), name - m_drive.size());
    m_title = path.substr(name, dot - name);
    m_extension = path.substr(dot);
    if (limited && (m_directory.size() >= k_partSize || m_title.size() >= k_partSize ||
                    m_extension.size() >= k_partSize)) {
        m_drive.clear();
        m_directory.clear();
        m_title.clear();
        m_extension.clear();
    }

    m_directory = WithoutTrailingSeparators(std::move(m_directory), m_separator);
    m_directory.erase(0, m_directory.find_first_not_of(m_separator));
    if (!m_extension.empty()) m_extension.erase(0, 1);
}

std::string CZipPathComponent::GetFileName() const {
    return m_extension.empty() ? m_title : m_title + "." + m_extension;
}

std::string CZipPathComponent::GetNoDrive() const { return Joined(m_directory, GetFileName(), m_separator); }

std::string CZipPathComponent::GetFilePath() const {
    return m_prefix + Joined(m_drive, m_directory, m_separator);
}

std::string CZipPathComponent::GetFullPath() const {
    return m_prefix + Joined(Joined(m_drive, m_directory, m_separator), GetFileName(), m_separator);
}

std::string CZipPathComponent::WithoutTrailingSeparators(std::string path, char separator) {
    while (!path.empty() && path.back() == separator) path.pop_back();
    return path;
}
