#pragma once

#include <string>

/// A path in its parts: prefix, drive, directory, file title, extension.
///
/// Paths inside archives, and those of the system whose calls the engine's terms come from, have backslashes;
/// paths on disk have the separator of the system that runs. The caller says which he has.
class CZipPathComponent {
public:
    static constexpr char definedSeparator = '\\';

    CZipPathComponent() = default;
    explicit CZipPathComponent(const std::string& path, char separator = definedSeparator)
        : m_separator(separator) {
        SetFullPath(path);
    }
    CZipPathComponent(const CZipPathComponent&) = default;
    CZipPathComponent(CZipPathComponent&&) = default;
    CZipPathComponent& operator=(const CZipPathComponent&) = default;
    CZipPathComponent& operator=(CZipPathComponent&&) = default;
    virtual ~CZipPathComponent() = default;

    /// Takes a path apart.
    ///
    /// Prefix     with backslashes "\\", "\\?\" or "\\?\unc\" (letters in any case); with slashes the
    ///            slashes that an absolute path begins with.
    /// Drive      a letter and a colon; only with backslashes.
    /// Directory  without separators at its ends.
    /// Extension  what follows the last dot of the last component, without the dot.
    /// Range      with backslashes a directory, title or extension of 256 characters or more cannot be
    ///            told, and all of them and the drive stay empty.
    void SetFullPath(const std::string& path);

    const std::string& GetFilePrefix() const { return m_prefix; }
    const std::string& GetFileDrive() const { return m_drive; }
    const std::string& GetFileDirectory() const { return m_directory; }
    const std::string& GetFileTitle() const { return m_title; }
    const std::string& GetFileExtension() const { return m_extension; }
    void SetFileExtension(const std::string& extension) { m_extension = extension; }

    /// Title, dot and extension; no dot without an extension.
    std::string GetFileName() const;
    /// Directory and file name.
    std::string GetNoDrive() const;
    /// Prefix, drive and directory.
    std::string GetFilePath() const;
    std::string GetFullPath() const;

    /// Without the separators at its end.
    static std::string WithoutTrailingSeparators(std::string path, char separator);

private:
    std::size_t PrefixLength(const std::string& path) const;
    bool IsSeparator(char c) const;
    void Split(const std::string& path);

    std::string m_directory;
    std::string m_title;
    std::string m_extension;
    std::string m_drive;
    std::string m_prefix;
    char m_separator = definedSeparator;
};
