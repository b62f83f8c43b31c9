#include <optional>
#include <stdexcept>

#include "V2/Vrl.h"
#include "bench/contender.h"

namespace bench {
namespace {

using vrl_v2::Vrl;

void need(qbxV2::eqbx_error result) {
    if (result != qbxV2::EQBX_NO_ERROR) {
        throw std::runtime_error(std::string("vrl: ") + qbxV2::get_error_description(result));
    }
}

qbxV2::eqbx_error load_memory(Vrl& whole, const document& input) {
    return whole.unmarshal(input.bytes.data(), static_cast<unsigned>(input.bytes.size()));
}

qbxV2::eqbx_error load_file(Vrl& whole, const document& input) {
    std::wstring path;
    return whole.loadFile(qbxV2::convert(&path, input.path));
}

/// Reading into the model, all values converted and checked.
template <qbxV2::eqbx_error (*load_from)(Vrl&, const document&)>
class load final : public contender {
public:
    void run(const document& input) override { need(load_from(m_whole.emplace(), input)); }

    std::size_t finish(const document& input) override {
        std::string written;
        if (!m_checked) {
            need(m_whole->marshal(&written));
            need_elements(count_elements(written), input);
            m_checked = true;
        }
        m_whole.reset();
        return input.bytes.size();
    }

private:
    std::optional<Vrl> m_whole;
    bool m_checked = false;
};

/// Writing from the model, all cardinalities checked.
class write : public contender {
public:
    void prepare(const document& input) override { need(load_memory(m_whole, input)); }

protected:
    Vrl m_whole;
};

class write_string final : public write {
public:
    void run(const document&) override { need(m_whole.marshal(&m_text)); }

    std::size_t finish(const document& input) override {
        need_elements(count_elements(m_text), input);
        const std::size_t size = m_text.size();
        m_text = std::string();
        return size;
    }

private:
    std::string m_text;
};

/// UTF-16 units in wide characters; its bytes are counted as the UTF-8 that they stand for.
class write_wide_string final : public write {
public:
    void run(const document&) override { m_result.emplace(m_whole.writeString()); }

    std::size_t finish(const document& input) override {
        need(m_result->getEqbxError());
        std::string text;
        qbxV2::convert(&text, m_result->getXmlDocument());
        m_result.reset();
        need_elements(count_elements(text), input);
        return text.size();
    }

private:
    std::optional<vrl_v2::XMLDocumentResult> m_result;
};

}  // namespace

std::unique_ptr<contender> vrl_load_memory() { return std::make_unique<load<load_memory>>(); }
std::unique_ptr<contender> vrl_load_file() { return std::make_unique<load<load_file>>(); }
std::unique_ptr<contender> vrl_write_string() { return std::make_unique<write_string>(); }
std::unique_ptr<contender> vrl_write_wide_string() { return std::make_unique<write_wide_string>(); }

}  // namespace bench
