#ifndef QRX_MODEL_FILE_MDF_CLASSCHOICE_H
#define QRX_MODEL_FILE_MDF_CLASSCHOICE_H

#include "store_interface/records/cls_ClassRegistrar.h"

#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

/// The classes that a record may be of at one place of a model file, by every name that is taken for them
/// there: the short one, the whole one and aliases, in any capitals.
class mdf_ClassChoice {
public:
    /// Where records derive from the class `base`.
    static const mdf_ClassChoice& Of(unsigned base);

    const std::vector<const cls_ClassEntry*>& Classes() const { return classes_; }
    /// One name for each class, the short one, for lists. A class that goes by the word of its base is not
    /// among them.
    const std::vector<std::string>& Names() const { return names_; }
    /// The class of that name, or null.
    const cls_ClassEntry* Find(std::string_view name) const;
    /// "did you mean 'StaticStep'?", or nothing.
    std::string DidYouMean(std::string_view name) const;

    /// What a class is called where several may stand, the short name first.
    static std::vector<std::string> WordsOf(const cls_ClassEntry& entry);
    /// Whether the class goes by the word of its base, which people take instead.
    static bool IsTwin(const cls_ClassEntry& entry);

private:
    void Fill(unsigned base);

    std::vector<const cls_ClassEntry*> classes_;
    std::vector<std::string> names_;
    /// In small letters; null where a word tells two.
    std::unordered_map<std::string, const cls_ClassEntry*> byWord_;
};

#endif
