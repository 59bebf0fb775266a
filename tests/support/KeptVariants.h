#ifndef QRX_TESTS_SUPPORT_KEPTVARIANTS_H
#define QRX_TESTS_SUPPORT_KEPTVARIANTS_H

#include "deck/oif_KeptDeck.h"
#include "deck/oif_Writer.h"
#include "deck_checks/dck_Check.h"
#include "deck_checks/dck_Kept.h"
#include "foundation/nex_Exception.h"
#include "store_interface/model/odb_Odb.h"
#include "tests/support/KeptTexts.h"

#include <memory>
#include <string>
#include <vector>

/// What is kept of a model must give the decks and findings of its variants that they have without.
class KeptVariants {
public:
    explicit KeptVariants(const odb_Odb& base) : base_(base) {
        try {
            keptDeck_ = oif_Writer(base_).Keep(texts_);
            keptChecks_ = dck_KeepChecks(base_, base_.DeckModelName());
        } catch (const QRXBasException&) {
            return; // nothing can be kept
        }
        for (const odiK_Repository& repository : odiK_Repositories()) {
            if (repository.IsInOrder()) continue;
            const cow_List<cow_String> names = repository.In(*base.DeckModel()).Keys();
            for (int i = 0; i < names.Length(); ++i) {
                for (int change = 0; change < kChanges; ++change)
                    variants_.push_back({&repository, names[i], names[(i + 1) % names.Length()], change});
            }
        }
    }

    std::size_t Count() const { return variants_.size(); }
    /// What is wrong with a variant; empty for nothing.
    std::string ProblemOf(std::size_t which) {
        const Variant& of = variants_[which];
        odb_Odb store;
        store.SetDeckModelName(base_.DeckModelName());
        odiK_Model& model = store.AddModel(base_.DeckModelName());
        model.Share(*base_.DeckModel());
        of.Apply(of.repository->In(model));
        const std::string told = std::string(of.repository->member) + "/" + of.name.CStr() + ", change " +
                                 std::to_string(of.change) + ": ";
        if (Deck(store, keptDeck_.get()) != Deck(store, nullptr)) return told + "another deck";
        if (Checks(store, keptChecks_.get()) != Checks(store, nullptr)) return told + "other findings";
        return {};
    }
    /// Of the model itself.
    std::string ProblemOfBase() {
        if (keptDeck_ == nullptr || keptChecks_ == nullptr) return {};
        if (Deck(base_, keptDeck_.get()) != Deck(base_, nullptr)) return "another deck of the model itself";
        if (Checks(base_, keptChecks_.get()) != Checks(base_, nullptr))
            return "other findings on the model itself";
        return {};
    }

private:
    static constexpr int kChanges = 5;
    struct Variant {
        const odiK_Repository* repository;
        cow_String name;
        cow_String next;
        int change;

        void Apply(mdl_Repository& in) const {
            switch (change) {
            case 0: return in.InsertRecord(name, in.ConstGetRecord(name));
            case 1: in.Remove(name); return;
            case 2: return in.InsertRecord(name + " 2", in.ConstGetRecord(name));
            case 3: return in.InsertRecord(name, in.ConstGetRecord(next));
            default: break;
            }
            cls_Record& record = in.WritableRecord(name);
            const cls_Field* field = record.DynFields().Find("suppressed");
            if (field == nullptr) return;
            bool& suppressed = *static_cast<bool*>(field->In(record));
            suppressed = !suppressed;
        }
    };

    /// The deck, or what writing it raised.
    std::string Deck(const odb_Odb& store, const oif_KeptDeck* kept) {
        texts_.deck.clear();
        try {
            if (kept != nullptr) {
                oif_Writer(store).WriteInput(texts_, *kept);
            } else {
                oif_Writer(store).WriteInput(static_cast<qio_ostream&>(texts_));
            }
        } catch (const QRXBasException& failure) {
            return Told(failure);
        }
        return texts_.deck;
    }
    static std::string Checks(const odb_Odb& store, const dck_Kept* kept) {
        fnd_List list;
        try {
            if (kept != nullptr) {
                dck_CheckDeck(store, store.DeckModelName(), *kept, list);
            } else {
                dck_CheckDeck(store, store.DeckModelName(), list);
            }
        } catch (const QRXBasException& failure) {
            return Told(failure);
        }
        std::string text;
        for (const fnd_Finding& finding : list.findings)
            text += finding.place + ": " + finding.Text() + " [" + std::string(finding.code->name) + "]\n";
        return text;
    }
    static std::string Told(const QRXBasException& failure) {
        return std::string("raised ") + failure.what() + " (" + std::string(failure.Context()) + ")";
    }

    const odb_Odb& base_;
    std::vector<Variant> variants_;
    KeptTexts texts_;
    std::unique_ptr<const oif_KeptDeck> keptDeck_;
    std::unique_ptr<const dck_Kept> keptChecks_;
};

#endif
