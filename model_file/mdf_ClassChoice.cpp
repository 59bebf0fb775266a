#include "model_file/mdf_ClassChoice.h"

#include "store_interface/findings/fnd_Nearest.h"
#include "store_interface/findings/fnd_Text.h"

#include <sstream>

const mdf_ClassChoice& mdf_ClassChoice::Of(unsigned base) {
    // Classes are the same for all readers, of which there is one a variant, until a program adds its own.
    thread_local std::unordered_map<unsigned, mdf_ClassChoice> choices;
    thread_local std::size_t known = 0;
    if (known != cls_Classes().All().size()) {
        known = cls_Classes().All().size();
        choices.clear();
    }
    const auto [place, isNew] = choices.try_emplace(base);
    if (isNew) place->second.Fill(base);
    return place->second;
}

void mdf_ClassChoice::Fill(unsigned base) {
    classes_ = cls_Classes().ConcreteClasses(base);
    for (const cls_ClassEntry* entry : classes_) {
        const bool isTwin = IsTwin(*entry);
        if (!isTwin) names_.emplace_back(entry->info.Word());
        for (const std::string& word : WordsOf(*entry)) {
            if (isTwin && word == entry->info.Word()) continue;
            const auto [known, isFirst] = byWord_.emplace(fnd_LowerCase(word), entry);
            if (!isFirst) known->second = nullptr;
        }
    }
}

const cls_ClassEntry* mdf_ClassChoice::Find(std::string_view name) const {
    const auto known = byWord_.find(fnd_LowerCase(name));
    return known == byWord_.end() ? nullptr : known->second;
}

std::string mdf_ClassChoice::DidYouMean(std::string_view name) const {
    const auto nearest = [this](std::string_view wrong) {
        fnd_Nearest near(wrong);
        for (const cls_ClassEntry* entry : classes_) {
            // The whole name is for files that say it.
            for (const std::string& word : WordsOf(*entry)) {
                if (word != entry->info.name) near.Try(word);
            }
        }
        return near.Hint();
    };
    const std::string hint = nearest(name);
    const std::size_t prefix = name.find('_');
    return hint.empty() && prefix != std::string_view::npos ? nearest(name.substr(prefix + 1)) : hint;
}

std::vector<std::string> mdf_ClassChoice::WordsOf(const cls_ClassEntry& entry) {
    std::vector<std::string> words{std::string(entry.info.Word()), entry.info.name};
    std::istringstream aliases(entry.info.aliases);
    for (std::string alias; aliases >> alias;) words.push_back(alias);
    return words;
}

bool mdf_ClassChoice::IsTwin(const cls_ClassEntry& entry) {
    const cls_ClassEntry* base = cls_Classes().Find(entry.baseId);
    return base != nullptr && base->create != nullptr && base->info.Word() == entry.info.Word();
}
