#include "store_interface/findings/fnd_TextRules.h"

#include "store_interface/findings/fnd_Text.h"

bool fnd_CheckName(std::string_view name, const fnd_Path& place, fnd_Sink& sink) {
    const fnd_NameProblem problem = fnd_ProblemOfName(name);
    if (!problem.found.empty()) sink.Add("name-in-deck", place, "found " + problem.found, problem.expected);
    return problem.found.empty();
}

bool fnd_CheckText(const cls_Field& field, std::string_view text, const fnd_Path& place, fnd_Sink& sink) {
    if (field.verbatim || field.freeText) return true;
    if (field.nameOf != nullptr) return fnd_CheckName(text, place, sink);
    const fnd_NameProblem problem = fnd_ProblemOfText(text);
    if (!problem.found.empty()) sink.Add("text-in-deck", place, "found " + problem.found, problem.expected);
    return problem.found.empty();
}
