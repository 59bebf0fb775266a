#ifndef QRX_DCK_KEPT_H
#define QRX_DCK_KEPT_H

#include "store_interface/model/odiK_Repositories.h"

#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <type_traits>

/// What was worked out of one model, for models that share with it (odiK_Model::Share): what has read nothing
/// in which they differ is the same of both.
class dck_Kept {
public:
    explicit dck_Kept(const odiK_Model& model) : model_(model.Name()) { model_.Share(model); }
    dck_Kept(const dck_Kept&) = delete;
    dck_Kept& operator=(const dck_Kept&) = delete;

private:
    friend class dck_Subject;
    struct Result {
        odiK_Extent read;
        std::shared_ptr<const void> value;
    };

    odiK_Model model_;
    std::map<std::string, Result, std::less<>> results_;
};

/// A model that is being checked.
class dck_Subject {
public:
    /// One of which nothing is kept.
    dck_Subject(const odiK_Model& model) : model_(model) {}
    /// Goes by what is kept of another model.
    dck_Subject(const odiK_Model& model, const dck_Kept& kept)
        : model_(model), kept_(&kept), differences_(odiK_Differences(kept.model_, model)) {}
    /// Keeps the results of this one.
    dck_Subject(const odiK_Model& model, dck_Kept* keeping) : model_(model), keeping_(keeping) {}

    const odiK_Model& Model() const { return model_; }

    /// The result of some work that takes all it needs from the model, within the work. One name is one kind
    /// of work.
    template <class Work>
    auto Of(std::string_view name, const Work& work) const {
        using T = std::remove_cvref_t<std::invoke_result_t<const Work&>>;
        if (keeping_ != nullptr) {
            const mdl_ReadNotes notes;
            auto value = std::make_shared<const T>(work());
            keeping_->results_.insert_or_assign(std::string(name),
                                                dck_Kept::Result{odiK_ReadOf(notes), value});
            return value;
        }
        if (kept_ != nullptr) {
            const auto place = kept_->results_.find(name);
            if (place != kept_->results_.end() && (place->second.read & differences_).none())
                return std::static_pointer_cast<const T>(place->second.value);
        }
        return std::make_shared<const T>(work());
    }

private:
    const odiK_Model& model_;
    dck_Kept* keeping_ = nullptr;
    const dck_Kept* kept_ = nullptr;
    odiK_Extent differences_;
};

#endif
