#include "store_interface/records/steps/kprC_StepWords.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/steps/kprC_Step.h"

std::string kprC_ProcedureWords(const kprC_Step& step) {
    const cow_String shortName = cls_Classes().ShortNameOf(step.DynTypeId());
    std::string_view name = shortName.View();
    if (name.ends_with("Step")) name.remove_suffix(4);
    std::string words;
    for (const char c : name) {
        const bool isCapital = c >= 'A' && c <= 'Z';
        if (isCapital && !words.empty()) words += ' ';
        words += isCapital ? static_cast<char>(c - 'A' + 'a') : c;
    }
    return words;
}
