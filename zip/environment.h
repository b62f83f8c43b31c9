#pragma once

#include "platform/clock.h"
#include "platform/file_descriptors.h"
#include "platform/file_names.h"
#include "platform/volumes.h"

class CZipRandomPool;

/// What an archive needs of the world around it. Whoever wants another world (failing files, a clock that
/// stands, known salts, removable disks) passes his own; it must outlive the archive.
struct CZipEnvironment {
    vrl_platform::file_descriptors& files;
    vrl_platform::file_names& names;
    vrl_platform::volumes& volumes;
    vrl_platform::clock& clock;
    CZipRandomPool& pool;

    /// The system's own, with the one random pool of the process.
    static const CZipEnvironment& System();
};
