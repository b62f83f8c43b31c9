#include "bench/machine.h"

#include <expat.h>
#include <libxml/xmlversion.h>
#include <sys/utsname.h>
#include <unistd.h>
#include <zip.h>
#include <zlib.h>

#include <fstream>
#include <pugixml.hpp>
#include <string>
#include <xercesc/util/XercesVersion.hpp>
#include <xsd/cxx/version.hxx>

namespace bench {
namespace {

std::string processor() {
    std::ifstream file("/proc/cpuinfo");
    for (std::string line; std::getline(file, line);) {
        const std::size_t colon = line.find(": ");
        if (line.compare(0, 10, "model name") == 0 && colon != std::string::npos)
            return line.substr(colon + 2);
    }
    return "unknown processor";
}

}  // namespace

void print_machine(std::ostream& os) {
    utsname system{};
    ::uname(&system);
    const long pages = ::sysconf(_SC_PHYS_PAGES);
    os << "- Machine: " << processor() << ", " << ::sysconf(_SC_NPROCESSORS_ONLN) << " cores, "
       << pages / 1024 * ::sysconf(_SC_PAGESIZE) / (1024 * 1024) << " GiB; " << system.sysname << ' '
       << system.release << ' ' << system.machine << "\n"
       << "- Compiler: " << VRL_BENCH_COMPILER << "\n"
       << "- Peers: " << XML_ExpatVersion() << ", libxml2 " << LIBXML_DOTTED_VERSION << ", pugixml "
       << PUGIXML_VERSION / 1000 << '.' << PUGIXML_VERSION / 10 % 100 << ", CodeSynthesis XSD "
       << XSD_STR_VERSION << " on Xerces-C++ " << XERCES_FULLVERSIONDOT << ", zlib " << zlibVersion()
       << ", libzip " << zip_libzip_version() << ", minizip\n";
}

}  // namespace bench
