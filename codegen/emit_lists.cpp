#include "codegen/emit_members.h"

namespace vrl_codegen {

void declare_value_list(printer& out) {
    out.print(R"(    unsigned size_$X$() const;
    $in$ get_$X$(unsigned i) const;
    qbxV2::eqbx_error set_$X$(unsigned i, $in$ value);
    qbxV2::eqbx_error append_$X$($in$ value);
    qbxV2::eqbx_error insert_$X$(unsigned i, $in$ value);
    void delete_$X$(unsigned i);
    void clear_$X$();
)");
}

void define_value_list(printer& out) {
    out.print(R"(unsigned $C$::size_$X$() const { return m_$X$.size(); }
$in$ $C$::get_$X$(unsigned i) const { return m_$X$.get(i); }
qbxV2::eqbx_error $C$::set_$X$(unsigned i, $in$ value) { return frame::set(m_$X$, i, value); }
qbxV2::eqbx_error $C$::append_$X$($in$ value) {
    m_$X$.append(value);
    return qbxV2::EQBX_NO_ERROR;
}
qbxV2::eqbx_error $C$::insert_$X$(unsigned i, $in$ value) {
    m_$X$.insert(i, value);
    return qbxV2::EQBX_NO_ERROR;
}
void $C$::delete_$X$(unsigned i) { m_$X$.erase(i); }
void $C$::clear_$X$() { m_$X$.clear(); }
)");
}

void declare_object_list(printer& out) {
    out.print(R"(    unsigned size_$X$() const;
    $class$ const& get_$X$(unsigned i) const;
    $class$& get_$X$(unsigned i);
    $class$& back_$X$();
    $class$& assign_$X$(unsigned i, $class$ const& value);
    qbxV2::eqbx_error append_$X$();
    qbxV2::eqbx_error insert_$X$(unsigned i);
    void delete_$X$(unsigned i);
    void clear_$X$();
)");
}

void define_object_list(printer& out) {
    out.print(R"(unsigned $C$::size_$X$() const { return m_$X$.size(); }
$class$ const& $C$::get_$X$(unsigned i) const { return m_$X$.get(i); }
$class$& $C$::get_$X$(unsigned i) { return m_$X$.reach(i); }
$class$& $C$::back_$X$() { return m_$X$.back(); }
$class$& $C$::assign_$X$(unsigned i, $class$ const& value) {
    frame::assign_by_swap(m_$X$.reach(i), value);
    return m_$X$.reach(i);
}
qbxV2::eqbx_error $C$::append_$X$() {
    m_$X$.append();
    return qbxV2::EQBX_NO_ERROR;
}
qbxV2::eqbx_error $C$::insert_$X$(unsigned i) {
    m_$X$.insert(i);
    return qbxV2::EQBX_NO_ERROR;
}
void $C$::delete_$X$(unsigned i) { m_$X$.erase(i); }
void $C$::clear_$X$() { m_$X$.clear(); }
)");
}

void declare_any_list(printer& out) {
    out.print(
        R"(    /// Elements of any name, as text. Written as they stand: an entry has to be well-formed XML.
    unsigned size_any() const;
    /// `ns` and `name` may be null.
    void get_any(unsigned i, std::string* ns, std::string* name, std::string* value) const;
    qbxV2::eqbx_error append_any(std::string const& value);
    qbxV2::eqbx_error insert_any(unsigned i, std::string const& value);
    void delete_any(unsigned i);
    void clear_any();
)");
}

void define_any_list(printer& out) {
    out.print(R"(unsigned $C$::size_any() const { return m_any.size(); }
void $C$::get_any(unsigned i, std::string* ns, std::string* name, std::string* value) const {
    const qbxV2::c_any_info& entry = m_any.get(i);
    if (ns != nullptr) *ns = entry.get_namespace();
    if (name != nullptr) *name = entry.get_name();
    *value = entry.get_value();
}
qbxV2::eqbx_error $C$::append_any(std::string const& value) { return insert_any(m_any.size(), value); }
qbxV2::eqbx_error $C$::insert_any(unsigned i, std::string const& value) {
    m_any.insert(i, qbxV2::c_any_info("", "", value));
    return qbxV2::EQBX_NO_ERROR;
}
void $C$::delete_any(unsigned i) { m_any.erase(i); }
void $C$::clear_any() { m_any.clear(); }
)");
}

}  // namespace vrl_codegen
