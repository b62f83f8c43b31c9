#pragma once

#include <cstddef>
#include <memory>
#include <streambuf>
#include <string>
#include <vector>

namespace vrl_v2::frame {

/// Takes the text of a document of any size and gives it as one string. A string that grows moves all it has
/// again and again; here every byte is moved once, at the end.
class text_blocks : public std::streambuf {
public:
    /// All that was put, which is gone here then.
    std::string take();

protected:
    int_type overflow(int_type c) override;
    std::streamsize xsputn(const char* text, std::streamsize length) override;

private:
    void add_block();

    std::vector<std::unique_ptr<char[]>> m_blocks;
};

}  // namespace vrl_v2::frame
