#pragma once

#include <exception>
#include <string>

/// The one exception of the ZIP engine: a code, and the path of the file at fault where there is one.
///
/// A code below 100 is the errno of a failed file operation. There are no message texts.
class CZipException : public std::exception {
public:
    enum Code : int {
        generic = 100,            ///< a step did not do what it had to
        badStructure = 101,       ///< no archive, a bad record, a short read
        badCrc = 102,             ///< the extracted data has another CRC-32 than the entry
        noSpannedCallback = 103,  ///< a spanned archive, and nobody to ask for its disks
        stoppedByCallback = 104,  ///< a volume callback said no
        stoppedUnfinished = 105,  ///< a callback stopped what cannot be undone: the archive is unfinished
        stoppedCleanly = 106,     ///< a callback stopped an operation, and it was undone
        notRemovable = 107,       ///< a spanned archive on a drive that is not removable
        tooManyVolumes = 108,
        fieldTooLong = 110,  ///< a name, a comment or an extra field of 65536 bytes or more
        badPassword = 112,
        noVolumeCallback = 114,  ///< the volume must be changed, and nobody is there to do it
        cannotDelete = 115,
        cannotRename = 116,
        noAttributeConversion = 117,
        badAuthentication = 119,  ///< the authentication code of an AES entry differs
        zip64 = 120,
        vectorNotGrown = 122,
        zlibStreamEnd = 500,
        zlibNeedDictionary = 501,
        zlibErrno = 502,
        zlibStream = 503,
        zlibData = 504,
        zlibMemory = 505,  ///< also from a memory file
        zlibBuffer = 506,
        zlibRelease = 507,
        bzip2Sequence = 600,
        bzip2Parameter = 601,
        bzip2Memory = 602,
        bzip2Data = 603,
        bzip2Magic = 604,
        bzip2Io = 605,
        bzip2UnexpectedEnd = 606,
        bzip2OutputFull = 607,
        bzip2Configuration = 608,
        bzip2Assertion = 609,
    };

    CZipException(int code, std::string path) : m_path(std::move(path)), m_code(code) {}

    int GetCode() const noexcept { return m_code; }
    const std::string& GetPath() const noexcept { return m_path; }

    /// The only place that raises it.
    [[noreturn]] static void Raise(int code, const std::string& path = {});

private:
    std::string m_path;
    int m_code;
};
