#include "zip/environment.h"

#include "platform/entropy.h"
#include "zip/random_pool.h"

const CZipEnvironment& CZipEnvironment::System() {
    static CZipRandomPool pool(vrl_platform::native_entropy(), vrl_platform::native_clock());
    static const CZipEnvironment system{vrl_platform::native_file_descriptors(),
                                        vrl_platform::native_file_names(), vrl_platform::native_volumes(),
                                        vrl_platform::native_clock(), pool};
    return system;
}
