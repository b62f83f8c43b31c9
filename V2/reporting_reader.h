#pragma once

#include <string>
#include <vector>

#include "V2/document_file.h"
#include "V2/document_source.h"

namespace vrl_v2 {

/// A reader that keeps every report and, if it is told to, goes on behind it. Content that an element must
/// not have is passed over up to the element's end, so that what stands behind it is read as if it had not
/// been there.
///
/// It always ends: it stops with the number of reports that the options allow, and at once when the input
/// cannot be read any further, since everything that is reported then follows from that.
class reporting_reader : public qbxV2::c_xml_reader {
public:
    /// Borrows both.
    reporting_reader(document_source& source, const load_options& options);

    qbxV2::eqbx_error user_handle_error(qbxV2::eqbx_error code, const std::string& item, const char* file,
                                        int line) override;

    /// Notes what ended the reading without having been reported.
    void note(qbxV2::eqbx_error code);
    std::vector<load_report>& reports() { return m_reports; }
    /// Whether the first report is that of a limit of the options.
    bool is_limit_exceeded() const { return m_limit_exceeded; }

private:
    std::string exceeded_limit(qbxV2::eqbx_error code);
    bool can_go_on(qbxV2::eqbx_error code) const;
    bool is_at_content() const;
    bool is_within(const std::string& element);
    bool skip_to_end_of_element();

    document_source& m_source;
    const load_options& m_options;
    std::vector<load_report> m_reports;
    bool m_limit_exceeded = false;
};

}  // namespace vrl_v2
