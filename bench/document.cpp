#include "bench/document.h"

#include <fstream>
#include <stdexcept>

namespace bench {

void read_file(const std::string& path, std::string* bytes) {
    std::ifstream file(path, std::ios::binary | std::ios::ate);
    if (!file) throw std::runtime_error("cannot read " + path);
    const std::streamsize size = file.tellg();
    bytes->resize(static_cast<std::size_t>(size));
    file.seekg(0);
    if (!file.read(bytes->data(), size)) throw std::runtime_error("cannot read " + path);
}

std::size_t count_elements(const std::string& xml) {
    std::size_t count = 0;
    for (std::size_t at = xml.find('<'); at != std::string::npos; at = xml.find('<', at + 1)) {
        const char next = at + 1 < xml.size() ? xml[at + 1] : '/';
        if (next != '/' && next != '?' && next != '!') ++count;
    }
    return count;
}

document read_document(const std::string& name, const std::string& path) {
    document made;
    made.name = name;
    made.path = path;
    read_file(path, &made.bytes);
    made.elements = count_elements(made.bytes);
    return made;
}

}  // namespace bench
