#pragma once

#include <string>

#include "platform/api.h"
#include "runtime/error_codes.h"

namespace vrl_v2 {

/// What `Vrl::writeString` gives: the whole document as UTF-16 text and the result code. The text is empty
/// where writing failed.
class VRL_API XMLDocumentResult {
public:
    XMLDocumentResult(std::wstring const& document, qbxV2::eqbx_error error)
        : m_document(document), m_error(error) {}

    std::wstring getXmlDocument() const { return m_document; }
    qbxV2::eqbx_error getEqbxError() const { return m_error; }

private:
    std::wstring m_document;
    qbxV2::eqbx_error m_error;
};

}  // namespace vrl_v2
