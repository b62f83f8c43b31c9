#include "bench/table.h"

#include <algorithm>
#include <array>
#include <cstdio>

namespace bench {
namespace {

const std::array<std::string, 6> k_head = {"document", "measured", "figure", "ratio", "target", "result"};
constexpr std::size_t k_first_number = 2;  // From this column on, flush right.

std::string text(double number, int digits) {
    std::array<char, 64> out{};
    std::snprintf(out.data(), out.size(), "%.*f", digits, number);
    return out.data();
}

std::string text(target goal) {
    if (goal.which == target::side::none) return "";
    return (goal.which == target::side::at_least ? ">= " : "<= ") + text(goal.bound, 2);
}

std::string padded(const std::string& cell, std::size_t width, bool right) {
    const std::string blanks(width - cell.size(), ' ');
    return right ? blanks + cell : cell + blanks;
}

}  // namespace

bool target::is_met_by(double figure) const {
    if (which == side::at_least) return figure >= bound;
    return which == side::none || figure <= bound;
}

std::string table::verdict(target goal, bool met) {
    if (goal.which == target::side::none) return "";
    if (!met) ++m_missed;
    return met ? "pass" : "MISSED";
}

void table::add_rate(const std::string& subject, const std::string& what, double rate, double ratio,
                     target goal) {
    m_rows.push_back({subject, what, text(rate, 0) + " MB/s", text(ratio, 2), text(goal),
                      verdict(goal, goal.is_met_by(ratio))});
}

void table::add_figure(const std::string& subject, const std::string& what, double figure, const char* unit,
                       int digits, target goal) {
    m_rows.push_back({subject, what, text(figure, digits) + " " + unit, "", text(goal),
                      verdict(goal, goal.is_met_by(figure))});
}

void table::add_missing(const std::string& subject, const std::string& what, const std::string& why,
                        target goal) {
    m_rows.push_back({subject, what, why, "", text(goal), verdict(goal, false)});
}

void table::print(std::ostream& os) const {
    std::vector<std::size_t> widths;
    for (std::size_t column = 0; column < k_head.size(); ++column) {
        std::size_t width = k_head[column].size();
        for (const row& one : m_rows) width = std::max(width, one[column].size());
        widths.push_back(width);
    }
    const auto print_row = [&](const auto& cells) {
        for (std::size_t column = 0; column < widths.size(); ++column) {
            os << "| " << padded(cells[column], widths[column], column >= k_first_number) << ' ';
        }
        os << "|\n";
    };
    print_row(k_head);
    for (std::size_t column = 0; column < widths.size(); ++column) {
        const bool right = column >= k_first_number;
        os << '|' << std::string(widths[column] + (right ? 1 : 2), '-') << (right ? ":" : "");
    }
    os << "|\n";
    for (const row& one : m_rows) print_row(one);
}

}  // namespace bench
