#pragma once

#include <functional>
#include <set>
#include <string>
#include <vector>

/// Ways in which a document can go wrong, applied to every element of a document in turn.
namespace vrl_driver {

struct mutation {
    const char* name;
    /// The codes that reading may answer with.
    std::set<int> codes;
    /// Changes the element; false where there is nothing of the kind to change.
    bool (*apply)(void* element);
};

/// The table of all mutations.
const std::vector<mutation>& mutations();

/// Calls `visit` with each form of a document that has one element changed, and the path of that element.
void for_each_mutation(const mutation& m, const std::string& document,
                       const std::function<void(const std::string& path, const std::string& mutated)>& visit);

}  // namespace vrl_driver
