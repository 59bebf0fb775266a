#include "model_file/mdf_Members.h"

#include <algorithm>

std::vector<std::string> mdf_MembersOf(const cls_FieldTable& fields, const std::vector<std::string>& others) {
    std::vector<std::string> names;
    for (const cls_Field& field : fields.All()) {
        if (!field.notModelData) names.emplace_back(field.name);
    }
    for (const std::string& other : others) {
        if (std::find(names.begin(), names.end(), other) == names.end()) names.push_back(other);
    }
    return names;
}

void mdf_CheckMembers(mdf_Diagnostics& diagnostics, const mdf_Value& object,
                      const std::vector<std::string>& known, const fnd_Path& path) {
    for (const mdf_Member& member : object.Members()) {
        if (std::find(known.begin(), known.end(), member.name) != known.end()) continue;
        diagnostics.Add("unknown-member", fnd_Path(path, member.name),
                        "found an unknown member " + fnd_Quoted(member.name),
                        known.empty() ? std::string("none") : fnd_OneOf(known, member.name),
                        fnd_DidYouMean(diagnostics, member.name, [&known](fnd_Nearest& nearest) {
                            for (const std::string& name : known) nearest.Try(name);
                        }));
    }
}

std::string mdf_MeaningWord(const cls_IntMeaning& meaning) {
    std::string word(meaning.word);
    word.erase(std::min(word.find_first_of("(,:"), word.size()));
    while (!word.empty() && word.back() == ' ') word.pop_back();
    return word;
}

std::string mdf_WordOfNumber(const cls_Field& field, int number) {
    for (const cls_IntMeaning& meaning : field.meanings) {
        if (meaning.value != number) continue;
        const std::string word = mdf_MeaningWord(meaning);
        for (const cls_IntMeaning& other : field.meanings) {
            if (omu_EqualInAnyCapitals(mdf_MeaningWord(other), word))
                return other.value == number ? word : std::string();
        }
    }
    return {};
}
