#ifndef QRX_STORE_ODIK_REFERENCES_H
#define QRX_STORE_ODIK_REFERENCES_H

#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/records/cls_FieldTable.h"

#include <map>
#include <set>

class odiK_Model;

/// Looks up the names by which records refer to other objects of a model. The model must not change
/// meanwhile.
class odiK_References {
public:
    explicit odiK_References(const odiK_Model& model) : model_(model) {}

    /// Says so if the model has no object of the name and of the kind and class that the field refers to. An
    /// empty name refers to nothing and is right; so is any name in a field that refers to nothing.
    void Check(const cls_Field& field, const std::string& name, const std::string& place, fnd_Sink& sink);

private:
    struct Names {
        std::vector<std::string> inOrder;
        std::set<std::string, std::less<>> lookup;
    };
    const Names& NamesOfKind(const std::string& kind);
    /// The name that was meant, or those that there are.
    static std::string Hint(const Names& names, const std::string& name, fnd_Sink& sink);
    /// What is said of an object that is there but of a class that the field doesn't take.
    void CheckClass(const cls_Field& field, const std::string& name, const std::string& place,
                    fnd_Sink& sink) const;

    const odiK_Model& model_;
    std::map<std::string, Names, std::less<>> known_;
};

#endif
