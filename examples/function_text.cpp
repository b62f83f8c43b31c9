#include "examples/function_text.h"

#include "examples/color_space_text.h"

namespace examples {
namespace {

using group = vrl_v2::sg_Function;

std::string text(const std::string& name, const vrl_v2::FunctionType& function) {
    return function.isset_Result() ? name + ' ' + number_text(function.get_Result()) : name;
}

std::string deviation_text(const group& held) {
    switch (held.getchosen()) {
        case group::chosen_FunctionStdDevX:
            return text("deviation of X", held.get_FunctionStdDevX());
        case group::chosen_FunctionStdDevY:
            return text("deviation of Y", held.get_FunctionStdDevY());
        case group::chosen_FunctionStdDevZ:
            return text("deviation of Z", held.get_FunctionStdDevZ());
        case group::chosen_FunctionStdDevL:
            return text("deviation of L", held.get_FunctionStdDevL());
        case group::chosen_FunctionStdDevA:
            return text("deviation of a", held.get_FunctionStdDevA());
        case group::chosen_FunctionStdDevB:
            return text("deviation of b", held.get_FunctionStdDevB());
        case group::chosen_FunctionStdDevC:
            return text("deviation of C", held.get_FunctionStdDevC());
        case group::chosen_FunctionStdDevH:
            return text("deviation of h", held.get_FunctionStdDevH());
        case group::chosen_FunctionAverageStdDevL:
            return text("average deviation of L", held.get_FunctionAverageStdDevL());
        case group::chosen_FunctionAverageStdDevA:
            return text("average deviation of a", held.get_FunctionAverageStdDevA());
        case group::chosen_FunctionAverageStdDevB:
            return text("average deviation of b", held.get_FunctionAverageStdDevB());
        default:
            return "(no function)";
    }
}

}  // namespace

std::string function_text(const vrl_v2::sg_Function& held) {
    switch (held.getchosen()) {
        // Under the element Function the object's own class says which function it is.
        case group::chosen_Function:
            return text(held.get_Function().getid(), held.get_Function());
        case group::chosen_FunctionGeneric:
            return text(narrow(held.get_FunctionGeneric().get_Name()), held.get_FunctionGeneric());
        case group::chosen_FunctionDE:
            return text("DE76", held.get_FunctionDE());
        case group::chosen_FunctionMeanDE:
            return text("mean DE76", held.get_FunctionMeanDE());
        case group::chosen_FunctionDE94:
            return text("DE94", held.get_FunctionDE94());
        case group::chosen_FunctionDE2000:
            return text("DE2000", held.get_FunctionDE2000());
        case group::chosen_FunctionDECMC:
            return text("DECMC", held.get_FunctionDECMC());
        default:
            return deviation_text(held);
    }
}

}  // namespace examples
