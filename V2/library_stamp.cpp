#include "V2/library_stamp.h"

namespace vrl_v2 {

SDKType this_library() {
    SDKType library;
    library.set_SDKName(L"Vrl2-QBX-3.7.6");
    library.get_SDKVersion().set_SDKVersion(L"1.0");
    return library;
}

}  // namespace vrl_v2
