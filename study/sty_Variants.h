#ifndef QRX_STY_VARIANTS_H
#define QRX_STY_VARIANTS_H

#include "deck/oif_KeptDeck.h"
#include "deck_checks/dck_Check.h"
#include "deck_checks/dck_Kept.h"
#include "model_file/mdf_Template.h"
#include "study/sty_DeckText.h"
#include "study/sty_Ledger.h"
#include "study/sty_Table.h"

#include <optional>
#include <set>

/// What the columns of a table stand for in a template.
class sty_Columns {
public:
    /// `inAllRows`: every row has all of them.
    sty_Columns(const std::vector<std::string>& names, bool inAllRows,
                const std::vector<mdf_Parameter>& parameters);

    /// All pointers that the columns lead to.
    std::vector<std::string> Pointers() const;
    /// What no row could be right with, where every row has all columns; empty for none.
    const std::string& Problem() const { return problem_; }
    const std::string& NameOf(int column) const { return columns_[static_cast<std::size_t>(column)].name; }

    /// The changes that a row's cells are, each with its column. What is wrong with them goes to the result.
    struct Change {
        int column;
        mdf_Change change;
    };
    std::vector<Change> ChangesOf(const sty_Row& row, const mdf_Template& base, sty_Result& result) const;

private:
    struct Column {
        std::string name;
        std::vector<std::string> pointers;
        mdf_Limits range;
        std::string limits;
        std::string unit;
        /// Why no value can stand in the column; empty when one can.
        std::string problem;
    };
    static std::string ProblemOf(const Column& column, const sty_Cell& cell);
    void FindConflicts(bool refuse);

    std::vector<Column> columns_;
    /// Pairs of columns that change one place.
    std::vector<std::pair<int, int>> conflicts_;
    std::string problem_;
};

/// Makes variants of a template and their decks, for one thread.
class sty_Variants {
public:
    sty_Variants(std::unique_ptr<mdf_Template> base, sty_MeshTexts& meshes);

    /// The same for another thread.
    std::unique_ptr<sty_Variants> Twin() const;
    /// What is to be said of the template's own deck.
    std::vector<fnd_Finding> Baseline();
    /// What every variant has in common needn't be told of each: findings among these are left out.
    void LeaveOut(const std::vector<fnd_Finding>& findings);

    /// Makes the row's variant and its deck's text; a row that is wrong has errors in its result.
    sty_Result Make(const sty_Row& row, const sty_Columns& columns);
    const mdf_Template& Base() const { return *template_; }
    /// The text of the last deck.
    sty_DeckText& Text() { return text_; }

private:
    std::vector<fnd_Finding> CheckDeck(const odb_Odb& store);
    void CheckMeshes(const odb_Odb& store, fnd_Sink& sink);
    void WriteDeck(const odb_Odb& store);
    bool SharesWithBase(const odb_Odb& store) const;
    /// What is kept of the template, made when a store that shares with it is the first to want it; null
    /// where there is nothing.
    template <class Kept, class Work>
    const Kept* Keep(std::optional<std::unique_ptr<const Kept>>& kept, const odb_Odb& store,
                     const Work& work);
    static std::string KeyOf(const fnd_Finding& finding);

    std::unique_ptr<mdf_Template> template_;
    sty_MeshTexts& meshes_;
    sty_DeckText text_;
    /// Null where the template raises.
    std::optional<std::unique_ptr<const oif_KeptDeck>> keptDeck_;
    std::optional<std::unique_ptr<const dck_Kept>> keptChecks_;
    std::set<std::string> leftOut_;
    /// What the quality of the last meshes is, by place.
    struct Quality {
        cow_CountedHld<odiK_Mesh> mesh;
        std::vector<fnd_Finding> findings;
    };
    std::map<std::string, Quality> qualities_;
};

#endif
