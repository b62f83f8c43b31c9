#pragma once

#include <libxml/tree.h>

#include <map>
#include <memory>
#include <set>
#include <string>
#include <vector>

namespace vrl_test {

/// The declarations of the schema, and which of them a document uses.
///
/// Each element and each attribute counts where it is declared, not by its name alone: `Name` of a person is
/// another one than `Name` of a process. Abstract elements cannot occur, and do not count.
class declarations {
public:
    /// Reads all modules of a folder.
    explicit declarations(const std::string& schema_folder);

    /// Notes what the elements and attributes of a document are declared by. Elements of free content count
    /// when they are the format's own. Throws std::runtime_error for one that is not declared.
    void use(const std::string& document_path);

    std::size_t count() const { return m_declared.size(); }
    /// What no document used, as "module: path of names".
    std::vector<std::string> unused() const;

private:
    struct free_document {
        void operator()(xmlDoc* document) const { xmlFreeDoc(document); }
    };

    void add_module(const std::string& path);
    void note(const xmlNode* declaration, const std::string& module);
    void walk(const xmlNode* element, const xmlNode* declaration);
    void walk_child(const xmlNode* child, const xmlNode* type);
    const xmlNode* type_of(const xmlNode* declaration) const;
    const xmlNode* instance_type(const xmlNode* element, const xmlNode* declaration) const;
    const xmlNode* base_of(const xmlNode* type) const;
    const xmlNode* find(const xmlNode* type, const char* kind, const std::string& name) const;
    const xmlNode* find_within(const xmlNode* node, const char* kind, const std::string& name) const;
    const xmlNode* find_by_reference(const std::string& reference, const std::string& name) const;

    std::vector<std::unique_ptr<xmlDoc, free_document>> m_modules;
    std::map<std::string, const xmlNode*> m_types;
    std::map<std::string, const xmlNode*> m_elements;
    std::map<const xmlNode*, std::string> m_declared;
    std::set<const xmlNode*> m_used;
};

}  // namespace vrl_test
