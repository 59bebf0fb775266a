#include "store_interface/records/steps/kprC_StepWords.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/steps/kprC_Step.h"

std::string kprC_ProcedureWords(const kprC_Step& step) {
    std::string name(cls_Classes().NameOf(step.DynTypeId()).View());
    if (name.starts_with("kprC_")) name.erase(0, 5);
    if (name.ends_with("Step")) name.erase(name.size() - 4);
    std::string words;
    for (const char c : name) {
        const bool isCapital = c >= 'A' && c <= 'Z';
        if (isCapital && !words.empty()) words += ' ';
        words += isCapital ? static_cast<char>(c - 'A' + 'a') : c;
    }
    return words;
}
