#pragma once

#include <map>
#include <streambuf>
#include <string>
#include <vector>

namespace vrl_v2 {

/// Follows XML text as it is written, and keeps where it stands: which elements are open, and how many
/// children each has. Where writing ends with an error, that is where something is missing.
class written_place : public std::streambuf {
public:
    /// The open elements as a path, each below the first with its number among those of its name:
    /// "/Vrl:Vrl/Vrl:Palette[2]". "/" when none is open.
    std::string path() const;
    /// Which child, in words.
    std::string description() const;

protected:
    int_type overflow(int_type c) override;
    std::streamsize xsputn(const char* text, std::streamsize length) override;

private:
    struct element {
        std::string name;
        int number = 1;
        int children = 0;
        std::map<std::string, int> names;
    };

    void take(char c);
    void end_tag();
    void open(const std::string& name);

    std::vector<element> m_open;
    std::string m_tag;
    bool m_in_tag = false;
    char m_quote = '\0';
};

}  // namespace vrl_v2
