#include <cstdio>
#include <stdexcept>

#include "V2/document_file.h"
#include "bench/packers/packer.h"

namespace bench {
namespace {

/// Loading a packed file into the model.
class loading final : public contender {
public:
    void prepare(const document& input) override { m_path = packed_path(input); }
    void run(const document&) override { m_result = vrl_v2::load_document(m_path); }

    std::size_t finish(const document& input) override {
        if (!m_result) throw std::runtime_error(m_result.message);
        if (!m_checked) {
            std::string text;
            if (!vrl_v2::save_document_to_memory(*m_result.document, text))
                throw std::runtime_error(m_path + ": not to be saved again");
            need_elements(count_elements(text), input);
            m_checked = true;
        }
        m_result.document.reset();
        return input.bytes.size();
    }

private:
    std::string m_path;
    vrl_v2::load_result m_result;
    bool m_checked = false;
};

/// Saving the model to a packed file, down to the disk.
class saving final : public contender {
public:
    void prepare(const document& input) override {
        m_path = input.path + ".door.vrlz";
        vrl_v2::load_result loaded = vrl_v2::load_document(input.path);
        if (!loaded) throw std::runtime_error(loaded.message);
        m_document = std::move(loaded.document);
    }

    void run(const document&) override { m_result = vrl_v2::save_document(*m_document, m_path); }

    std::size_t finish(const document& input) override {
        if (!m_result) throw std::runtime_error(m_result.message);
        if (!m_checked) {
            const vrl_v2::load_result loaded = vrl_v2::load_document(m_path);
            std::string text;
            if (!loaded || !vrl_v2::save_document_to_memory(*loaded.document, text))
                throw std::runtime_error(m_path + ": not to be loaded again");
            need_elements(count_elements(text), input);
            m_checked = true;
        }
        std::remove(m_path.c_str());
        return input.bytes.size();
    }

private:
    std::string m_path;
    std::unique_ptr<vrl_v2::Vrl> m_document;
    vrl_v2::save_result m_result;
    bool m_checked = false;
};

}  // namespace

std::unique_ptr<contender> door_load() { return std::make_unique<loading>(); }
std::unique_ptr<contender> door_save() { return std::make_unique<saving>(); }

}  // namespace bench
