#pragma once

#include <ostream>
#include <string>
#include <vector>

namespace bench {

/// A bound that a figure has to keep.
struct target {
    enum class side { none, at_least, at_most };
    side which = side::none;
    double bound = 0.0;

    bool is_met_by(double figure) const;
};

inline target at_least(double bound) { return {target::side::at_least, bound}; }
inline target at_most(double bound) { return {target::side::at_most, bound}; }

/// The result of the whole run, as a table in Markdown that can be read as it is.
class table {
public:
    /// A figure with its unit. The verdict is on the ratio.
    void add_rate(const std::string& subject, const std::string& what, double rate, double ratio,
                  target goal);
    /// A figure that is judged itself.
    void add_figure(const std::string& subject, const std::string& what, double figure, const char* unit,
                    int digits, target goal);
    /// A figure that could not be taken: a miss.
    void add_missing(const std::string& subject, const std::string& what, const std::string& why,
                     target goal);

    /// Whether every target was met.
    bool all_met() const { return m_missed == 0; }
    unsigned missed() const { return m_missed; }
    void print(std::ostream& os) const;

private:
    using row = std::vector<std::string>;
    std::string verdict(target goal, bool met);

    std::vector<row> m_rows;
    unsigned m_missed = 0;
};

}  // namespace bench
