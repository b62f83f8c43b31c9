#include <algorithm>
#include <cstring>

#include "zip/central_directory.h"
#include "zip/growth.h"
#include "zip/storage.h"

namespace ZipArchiveLib {

int CompareNames(const std::string& first, const std::string& second) {
    return std::strcoll(first.c_str(), second.c_str());
}

int CompareNamesWithoutCase(const std::string& first, const std::string& second) {
    const auto lowered = [](const std::string& name) {
        std::string text = name;
        for (char& c : text)
            if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
        return text;
    };
    return CompareNames(lowered(first), lowered(second));
}

}  // namespace ZipArchiveLib

void CZipCentralDir::EnableFindFast(bool enable, bool caseSensitive) {
    m_info->findFastEnabled = enable;
    m_findArray.clear();
    if (enable) BuildFindArray(caseSensitive);
}

void CZipCentralDir::BuildFindArray(bool caseSensitive) {
    m_info->findCaseSensitive = caseSensitive;
    m_info->compare = caseSensitive ? ZipArchiveLib::CompareNames : ZipArchiveLib::CompareNamesWithoutCase;
    m_findArray.clear();
    for (std::size_t i = 0; i < m_headers.size(); ++i)
        ZipArchiveLib::PushBack(m_findArray, {m_headers[i].get(), static_cast<std::uint16_t>(i)},
                                m_storage->GetArchivePath());
    std::stable_sort(m_findArray.begin(), m_findArray.end(), [this](const auto& first, const auto& second) {
        return m_info->compare(first.header->GetFileName(), second.header->GetFileName()) < 0;
    });
}

// The first record whose name is not before this one.
std::vector<CZipCentralDir::FindRecord>::iterator CZipCentralDir::FindPlace(const std::string& name) {
    return std::lower_bound(m_findArray.begin(), m_findArray.end(), name,
                            [this](const FindRecord& record, const std::string& wanted) {
                                return m_info->compare(record.header->GetFileName(), wanted) < 0;
                            });
}

void CZipCentralDir::InsertIntoFindArray(std::uint16_t index) {
    CZipFileHeader& header = GetHeader(index);
    const auto place = FindPlace(header.GetFileName()) - m_findArray.begin();
    ZipArchiveLib::PushBack(m_findArray, {&header, index}, m_storage->GetArchivePath());
    std::rotate(m_findArray.begin() + place, m_findArray.end() - 1, m_findArray.end());
}

std::uint16_t CZipCentralDir::FindEntry(const std::string& name, bool caseSensitive) {
    if (m_findArray.size() != m_headers.size() || m_info->findCaseSensitive != caseSensitive)
        BuildFindArray(caseSensitive);
    const auto place = FindPlace(name);
    if (place == m_findArray.end() || m_info->compare(place->header->GetFileName(), name) != 0)
        return k_notFound;
    return place->index;
}

void CZipCentralDir::RemoveFromFindArray(std::uint16_t index, bool shift) {
    m_findArray.erase(std::remove_if(m_findArray.begin(), m_findArray.end(),
                                     [index](const FindRecord& record) { return record.index == index; }),
                      m_findArray.end());
    if (!shift) return;
    for (FindRecord& record : m_findArray)
        if (record.index > index) --record.index;
}
