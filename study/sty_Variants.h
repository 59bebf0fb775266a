#ifndef QRX_STY_VARIANTS_H
#define QRX_STY_VARIANTS_H

#include "model_file/mdf_Template.h"
#include "study/sty_DeckText.h"
#include "study/sty_Ledger.h"
#include "study/sty_Table.h"

#include <set>

/// What the columns of a table stand for in a template.
class sty_Columns {
public:
    sty_Columns(const sty_Table& table, const std::vector<mdf_Parameter>& parameters);

    /// All pointers that the columns lead to.
    std::vector<std::string> Pointers() const;
    /// What no row of a table with a header could be right with; empty for none.
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
    sty_Variants(std::unique_ptr<mdf_Template> base, const sty_Columns& columns, sty_MeshTexts& meshes);

    /// The same for another thread.
    std::unique_ptr<sty_Variants> Twin() const;
    /// What is to be said of the template's own deck.
    std::vector<fnd_Finding> Baseline();
    /// What every variant has in common needn't be told of each: findings among these are left out.
    void LeaveOut(const std::vector<fnd_Finding>& findings);

    /// Makes the row's variant and its deck's text; a row that is wrong has errors in its result.
    sty_Result Make(const sty_Row& row);
    /// The text of the last deck.
    sty_DeckText& Text() { return text_; }

private:
    std::vector<fnd_Finding> CheckDeck(const odb_Odb& store);
    void CheckMeshes(const odb_Odb& store, fnd_Sink& sink);
    void TakeErrors(const mdf_Report& report, const std::vector<sty_Columns::Change>& changes,
                    sty_Result& result);
    static std::string KeyOf(const fnd_Finding& finding);

    std::unique_ptr<mdf_Template> template_;
    const sty_Columns& columns_;
    sty_MeshTexts& meshes_;
    sty_DeckText text_;
    std::set<std::string> leftOut_;
    /// What the quality of the last meshes is, by place.
    struct Quality {
        cow_CountedHld<odiK_Mesh> mesh;
        std::vector<fnd_Finding> findings;
    };
    std::map<std::string, Quality> qualities_;
};

#endif
