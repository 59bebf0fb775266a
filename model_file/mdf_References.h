#ifndef QRX_MODEL_FILE_MDF_REFERENCES_H
#define QRX_MODEL_FILE_MDF_REFERENCES_H

#include "model_file/mdf_Diagnostics.h"

#include <set>

/// The names by which records refer to other objects; they are looked up when all objects are there.
class mdf_References {
public:
    mdf_References(const odiK_Model& model, mdf_Diagnostics& diagnostics)
        : model_(model), diagnostics_(diagnostics) {}

    /// Takes the name that stands in the field, if fields like it refer to anything.
    void Note(const cls_Field& field, const std::string& name, const fnd_Path& path);
    /// Tells that an object of the name is given but wrong: what refers to it is not reported too.
    void NoteWrong(std::string_view name) { wrong_.emplace(name); }
    bool IsWrong(std::string_view name) const { return wrong_.count(name) != 0; }
    /// Looks all names up.
    void Check();

private:
    struct Reference {
        const cls_Field* field;
        std::string name;
        std::string pointer;
    };

    const odiK_Model& model_;
    mdf_Diagnostics& diagnostics_;
    std::vector<Reference> references_;
    std::set<std::string, std::less<>> wrong_;
};

/// Copies of names as std::string.
std::vector<std::string> mdf_Names(const cow_List<cow_String>& names);

#endif
