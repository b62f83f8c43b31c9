#pragma once

#include <cstdint>
#include <map>
#include <string>

/// Asked when the archive needs another volume.
class CZipVolumeCallback {
public:
    /// Why it is asked.
    enum Code : int {
        readVolume = 0,    ///< a volume is to be read
        writeVolume = 1,   ///< a new volume is to be written
        nameExists = 2,    ///< a file of the name is there already, or the label could not be set
        cannotCreate = 4,  ///< the file could not be created
        fileMissing = 5,   ///< the volume to be read is not there
    };
    struct Request {
        Code code = readVolume;
        std::uint64_t bytesNeeded = 0;
        /// The proposed path. For split archives the callback may put another in its place.
        std::string path;
        /// Counted from 1; -1 for the last volume of a split archive that is read.
        int volume = 0;
    };

    CZipVolumeCallback() = default;
    CZipVolumeCallback(const CZipVolumeCallback&) = delete;
    CZipVolumeCallback& operator=(const CZipVolumeCallback&) = delete;
    virtual ~CZipVolumeCallback() = default;

    /// False stops the operation with code 104.
    virtual bool RequestVolume(Request& request) = 0;
};

/// Told about work in progress.
class CZipProgressCallback {
public:
    CZipProgressCallback() = default;
    CZipProgressCallback(const CZipProgressCallback&) = delete;
    CZipProgressCallback& operator=(const CZipProgressCallback&) = delete;
    virtual ~CZipProgressCallback() = default;

    /// `bytes` have been taken in since the last call. False stops the operation: code 106 when the archive
    /// is then as it was before, 105 when that cannot be had.
    virtual bool Advance(std::uint64_t bytes) = 0;
};

/// What a progress callback can be registered for.
enum class CZipCallbackType : int { add, moveData };

/// Not owned.
using CZipCallbacks = std::map<CZipCallbackType, CZipProgressCallback*>;
