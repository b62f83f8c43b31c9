#pragma once

#include <string>

#include "V2/Vrl.h"

/// The way of `Vrl::loadFile` and `Vrl::writeFile` to ".vrlz" files: the joint to the ZIP engine.
namespace vrl_v2 {

/// What a ZIP step that failed behind the opening of the archive becomes.
inline constexpr qbxV2::eqbx_error k_packed_failed = qbxV2::EQBX_USER_ERROR_1;

/// Reads the first entry of an archive, whatever its name. Failures of opening it, of finding the entry and
/// of allocating its declared size leave as exceptions (`CZipException`; code 100 for an archive without
/// entries); all later ones give `k_packed_failed`.
qbxV2::eqbx_error load_packed(Vrl& document, const std::wstring& path);

/// Packs the file `source` into a new archive. Failures of opening the archive leave as exceptions; later
/// ones give `k_packed_failed`, and the source stays. On success the source is deleted.
qbxV2::eqbx_error pack_file(const std::wstring& source, const std::wstring& path);

}  // namespace vrl_v2
