#include "codegen/emit_class.h"

namespace vrl_codegen {
namespace {

/// The operations of a polymorphic class stand in this order in its table of virtual functions.
void declare_virtual_operations(printer& out, const class_plan& made) {
    const std::string word = made.base.empty() ? "virtual " : "";
    const std::string overrides = made.base.empty() ? "" : " override";
    out.print(R"(    $virtual$$C$* clone() const$override$;
    $virtual$~$C$()$override$;
    $virtual$char const* getid() const$override$;
    $virtual$bool has_id(char const* identity) const$override$;
    $virtual$qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const$override$;
    $virtual$qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name)$override$;
)",
              {{"virtual", word}, {"override", overrides}});
}

void declare_own_reading_and_writing(printer& out, const class_plan& made) {
    if (made.has_identity) {
        declare_virtual_operations(out, made);
        return;
    }
    const std::string overrides = made.base.empty() ? "" : " override";
    const std::string marks = made.polymorphic ? " override" : "";
    out.print(R"(    $virtual$~$C$()$override$;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const$mark$;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name)$mark$;
)",
              {{"virtual", made.base.empty() ? "virtual " : ""}, {"override", overrides}, {"mark", marks}});
}

void declare_copying(printer& out) {
    out.print(R"(    $C$();
    $C$($C$ const& other);
    $C$& operator=($C$ const& other);
)");
}

void declare_entry_points(printer& out) {
    out.print(R"(
    /// Reads a document: packed where the path ends in ".vrlz", plain otherwise. Does not reset the object
    /// first.
    qbxV2::eqbx_error loadFile(std::wstring const& path);
    qbxV2::eqbx_error loadString(std::wstring const& xml);
    /// Writes a document to a path that ends in ".vrl" or ".vrlz" (EQBX_USER_ERROR_2 otherwise), with CR LF
    /// at line ends. Stamps `WriteSDKInformation`, const or not. A file that can't be opened goes unnoticed.
    qbxV2::eqbx_error writeFile(std::wstring const& path) const;
    XMLDocumentResult writeString() const;
)");
}

void declare_nil(printer& out, const class_plan& made) {
    out.print(R"(
    /// Whether the element is written as `xsi:nil`, without content.
    bool isnil_$C$() const;
    void setnil_$C$();
)");
    if (!made.renamed_text.empty()) {
        out.print(R"(    /// The text; setting it clears the nil flag.
    $in$ get_$C$() const;
    qbxV2::eqbx_error set_$C$($in$ value);
)",
                  {{"in", made.renamed_text}});
    }
}

void declare_steps(printer& out, const class_plan& made) {
    out.print(R"(
protected:
    friend struct frame::access;
    void make_room_for($C$ const& other);
    void exchange($C$& other) noexcept;
)");
    if (made.has_own_attribute_reading()) {
        out.print(
            R"(    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
)");
    }
    if (made.has_own_attributes()) {
        out.print(R"(    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
)");
    }
    if (made.has_own_content()) {
        out.print(
            R"(    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error$content$);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;
)",
            {{"content", made.text_only ? ", bool has_content" : ""}});
    }
}

void declare_private(printer& out, const class_plan& made) {
    out.print("\nprivate:\n");
    if (made.has_init()) out.print("    void init();\n");
    if (made.kind == class_kind::choice) {
        out.print("    void choose(eqbx_chosen option);\n    void release_choice();\n");
        out.print("\n    eqbx_chosen m_chosen = chosen_none;\n");
    }
    for (const member_plan& member : made.members) declare_storage(out, member);
    if (made.nillable) out.print("    bool m_nil = false;\n");
}

void declare_full_class(printer& out, const class_plan& made) {
    out.print(made.base.empty() ? "class VRL_API $C$ {\npublic:\n"
                                : "class VRL_API $C$ : public $base$ {\npublic:\n");
    if (made.has_identity) {
        out.print("    /// Identity of this class, compared by pointer.\n    static char const* id;\n\n");
    }
    if (made.kind == class_kind::choice) declare_choice(out, made);
    declare_copying(out);
    declare_own_reading_and_writing(out, made);
    if (!made.factory.empty()) {
        out.print(
            R"(    /// A new object of the class of this family whose `id` is `type_name`; the caller owns it. Null when
    /// there is none, or when `ns_id` is not the document namespace's.
    static $C$* factory(int ns_id, std::string const& type_name);
)");
    }
    out.print(R"(
    void swap($C$& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;
)");
    declare_standalone(out, made);
    if (made.is_document()) declare_entry_points(out);
    for (const member_plan& member : made.members) declare_accessors(out, member);
    if (made.nillable) declare_nil(out, made);
    declare_steps(out, made);
    declare_private(out, made);
    out.print("};\n\n");
}

void declare_thin_class(printer& out, const class_plan& made) {
    out.print("class VRL_API $C$ : public $base$ {\npublic:\n");
    declare_copying(out);
    declare_own_reading_and_writing(out, made);
    declare_standalone(out, made);
    out.print("};\n\n");
}

}  // namespace

std::string emit_module_header(const module_plan& module) {
    printer out;
    out.print(R"(// Generated from schema/$module$.xsd. To change it, change the schema or V2/frame.
#pragma once

#include <iosfwd>
#include <string>

#include "V2/document_result.h"
#include "V2/forward.h"
#include "V2/frame/storage.h"
)",
              {{"module", module.name}});
    for (const std::string& needed : module.depends_on) {
        out.print("#include \"V2/$it$.h\"\n", {{"it", needed}});
    }
    out.print(R"(#include "platform/api.h"
#include "runtime/values.h"
#include "runtime/xml_reader.h"
#include "runtime/xml_writer.h"

namespace vrl_v2 {

)");
    for (const class_plan* made : module.classes) {
        const printer_scope scope(out, {{"C", made->name}, {"base", made->base}});
        out.print(comment(made->documentation, ""));
        if (made->kind == class_kind::group) {
            declare_group(out, *made);
        } else if (made->declares_members) {
            declare_full_class(out, *made);
        } else {
            declare_thin_class(out, *made);
        }
    }
    out.print("}  // namespace vrl_v2\n");
    return out.text();
}

}  // namespace vrl_codegen
