#include "examples/listing.h"

#include <iomanip>
#include <ostream>
#include <string>

#include "examples/color_space_text.h"
#include "examples/function_text.h"
#include "examples/swatch.h"

namespace examples {
namespace {

class listing {
public:
    listing(std::ostream& out, bool color) : m_out(out), m_color(color) {}

    void colors(const vrl_v2::Vrl& document) {
        for (unsigned i = 0; i < document.size_Color(); ++i) color(document.get_Color(i));
    }

    void palette(const vrl_v2::PaletteType& palette) {
        m_out << "  palette \"" << narrow(palette.get_PaletteName()) << "\"\n";
        for (unsigned i = 0; i < palette.size_ColorSet(); ++i) color_set(palette.get_ColorSet(i));
    }

    void quality_control(const vrl_v2::ColorQualityControlType& record) {
        m_out << "  quality control \"" << narrow(record.get_Name()) << "\"\n";
        for (unsigned i = 0; i < record.size_StandardAndMeasurement(); ++i) {
            const vrl_v2::StandardAndMeasurementType& pair = record.get_StandardAndMeasurement(i);
            if (!pair.get_Standard().isnil_Standard()) standard(pair.get_Standard());
            for (unsigned k = 0; k < pair.size_Measurement(); ++k) measurement(pair.get_Measurement(k));
        }
    }

private:
    void color_set(const vrl_v2::ColorSetType& set) {
        m_out << "    set \"" << narrow(set.get_ColorSetName()) << "\", " << count(set.size_Color(), "color")
              << '\n';
        for (unsigned i = 0; i < set.size_Color(); ++i) color(set.get_Color(i));
    }

    void color(const vrl_v2::ColorType& color) {
        m_out << "      ";
        if (m_color) m_out << swatch(color) << ' ';
        const bool in_one_line = color.size_ColorSpace() <= 5;
        m_out << std::left << std::setw(in_one_line ? 24 : 0) << narrow(color.get_ColorName());
        for (unsigned i = 0; i < color.size_ColorSpace(); ++i) {
            m_out << (!in_one_line ? "\n          " : i == 0 ? " " : " | ");
            m_out << color_space_text(color.get_ColorSpace(i));
        }
        m_out << '\n';
    }

    void standard(const vrl_v2::Standard& standard) {
        m_out << "    standard, " << count(standard.size_Tolerance(), "tolerance") << '\n';
        color(standard.get_Color());
    }

    void measurement(const vrl_v2::Measurement& measurement) {
        m_out << "    measurement";
        for (unsigned i = 0; i < measurement.size_Function(); ++i) {
            m_out << (i == 0 ? ": " : ", ") << function_text(measurement.get_Function(i));
        }
        m_out << '\n';
        color(measurement.get_Color());
    }

    /// "3 colors", "1 color".
    static std::string count(unsigned n, const std::string& what) {
        return std::to_string(n) + ' ' + what + (n == 1 ? "" : "s");
    }

    std::ostream& m_out;
    bool m_color;
};

}  // namespace

void print_document(std::ostream& out, const vrl_v2::Vrl& document, bool color) {
    const vrl_v2::Header& header = document.get_Preamble().get_Header();
    out << narrow(header.isset_Name() ? header.get_Name() : header.get_Purpose()) << '\n';
    listing lines(out, color);
    lines.colors(document);
    for (unsigned i = 0; i < document.size_Palette(); ++i) lines.palette(document.get_Palette(i));
    for (unsigned i = 0; i < document.size_ColorQualityControl(); ++i) {
        lines.quality_control(document.get_ColorQualityControl(i));
    }
}

}  // namespace examples
