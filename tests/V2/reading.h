#pragma once

#include <algorithm>
#include <cstddef>
#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "V2/Vrl.h"
#include "V2/format.h"

/// Reading with a record of every report, and an answer to each.
namespace vrl_test {

using qbxV2::eqbx_error;

struct report {
    eqbx_error code;
    std::string item;
    std::string file;
    int line;
    std::string message;  ///< what the reader tells at that moment
};

using answer = std::function<eqbx_error(const report&)>;

inline eqbx_error refuse(const report& r) { return r.code; }
inline eqbx_error forgive(const report&) { return qbxV2::EQBX_NO_ERROR; }

class recording_reader : public qbxV2::c_xml_reader_memory {
public:
    recording_reader(const std::string& text, answer reply)
        : recording_reader(text.data(), text.size(), std::move(reply)) {}
    recording_reader(const char* data, std::size_t size, answer reply)
        : c_xml_reader_memory(data, size), m_reply(std::move(reply)) {
        add_namespace_mapping("Vrl", vrl_v2::k_document_namespace_uri);
        add_namespace_mapping("xsi", "http://www.w3.org/2001/XMLSchema-instance");
    }

    eqbx_error user_handle_error(eqbx_error code, const std::string& item, const char* file,
                                 int line) override {
        std::string message;
        get_error_message(&message);
        m_reports.push_back({code, item, file, line, message});
        return m_reply(m_reports.back());
    }

    const std::vector<report>& reports() const { return m_reports; }

private:
    answer m_reply;
    std::vector<report> m_reports;
};

/// What came of a reading.
struct outcome {
    int code = 0;
    std::vector<report> reports;

    std::vector<int> codes() const {
        std::vector<int> all;
        for (const report& r : reports) all.push_back(r.code);
        return all;
    }
    std::vector<std::string> items() const {
        std::vector<std::string> all;
        for (const report& r : reports) all.push_back(r.item);
        return all;
    }
    int count(int wanted) const {
        const std::vector<int> all = codes();
        return static_cast<int>(std::count(all.begin(), all.end(), wanted));
    }
};

/// Reads an element of any class, whatever its name. The prefixes need no declaration in the text.
template <class T>
outcome read_element(T& object, const std::string& xml, const answer& reply = refuse) {
    recording_reader reader(xml, reply);
    reader.set_ns_map(vrl_v2::document_namespaces());
    qbxV2::c_xml_reader_local scope(reader);
    eqbx_error error = qbxV2::EQBX_NO_ERROR;
    std::string name;
    reader.get_element_event(nullptr, &error, &name);
    if (error == qbxV2::EQBX_NO_ERROR) error = object.unmarshal(reader, name);
    return {error, reader.reports()};
}

/// Reads a document whose outermost element is the class's own.
template <class T>
outcome read_document(T& object, const std::string& xml, const answer& reply = refuse) {
    recording_reader reader(xml, reply);
    const eqbx_error code = object.unmarshal(reader);
    return {code, reader.reports()};
}

}  // namespace vrl_test
