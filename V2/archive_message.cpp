#include "V2/archive_message.h"

#include "zip/exception.h"

namespace vrl_v2 {
namespace {

struct row {
    int code;
    const char* text;
};

constexpr row k_rows[] = {
    {CZipException::generic, "a step of the ZIP engine failed"},
    {CZipException::badStructure, "this is no ZIP archive, or it is damaged, cut off or of the ZIP64 form"},
    {CZipException::badCrc, "the data is not what was packed (its CRC differs)"},
    {CZipException::noSpannedCallback, "the archive is spread over several disks"},
    {CZipException::stoppedByCallback, "a volume of the archive was refused"},
    {CZipException::stoppedUnfinished, "stopped in the middle; the archive is unfinished"},
    {CZipException::stoppedCleanly, "stopped; the archive is as it was"},
    {CZipException::notRemovable, "the archive is spread over several disks, and this is none"},
    {CZipException::tooManyVolumes, "the archive has too many volumes"},
    {CZipException::fieldTooLong, "a name or a comment is too long for an archive"},
    {CZipException::badPassword, "the document is enciphered; packed documents have no password"},
    {CZipException::noVolumeCallback, "the archive goes on in another volume"},
    {CZipException::cannotDelete, "a file could not be deleted"},
    {CZipException::cannotRename, "a file could not be renamed"},
    {CZipException::noAttributeConversion, "the archive comes from a system that is not known"},
    {CZipException::badAuthentication, "the enciphered data was changed"},
    {CZipException::zip64, "the archive is of the ZIP64 form, which is not supported"},
    {CZipException::vectorNotGrown, "out of memory"},
    {CZipException::zlibStreamEnd, "zlib: unexpected end of stream"},
    {CZipException::zlibNeedDictionary, "zlib: the data needs a dictionary"},
    {CZipException::zlibErrno, "zlib: file error"},
    {CZipException::zlibStream, "zlib: stream error"},
    {CZipException::zlibData, "the compressed data is damaged"},
    {CZipException::zlibMemory, "out of memory"},
    {CZipException::zlibBuffer, "the compressed data is cut off"},
    {CZipException::zlibRelease, "zlib: another version than expected"},
    {CZipException::bzip2Sequence, "bzip2: sequence error"},
    {CZipException::bzip2Parameter, "bzip2: parameter error"},
    {CZipException::bzip2Memory, "out of memory"},
    {CZipException::bzip2Data, "the compressed data is damaged"},
    {CZipException::bzip2Magic, "the compressed data is not bzip2's"},
    {CZipException::bzip2Io, "bzip2: file error"},
    {CZipException::bzip2UnexpectedEnd, "the compressed data is cut off"},
    {CZipException::bzip2OutputFull, "bzip2: no room for output"},
    {CZipException::bzip2Configuration, "bzip2: wrong configuration"},
    {CZipException::bzip2Assertion, "bzip2: internal error"},
};

}  // namespace

std::string archive_message(int code) {
    for (const row& entry : k_rows) {
        if (entry.code == code) return entry.text;
    }
    return "ZIP error " + std::to_string(code);
}

}  // namespace vrl_v2
