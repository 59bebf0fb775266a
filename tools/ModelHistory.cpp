#include "tools/ModelHistory.h"

#include "base/oif_ModelInfo.h"
#include "conditions/oif_BoundaryConditionBuilder.h"
#include "deck_checks/dck_Text.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/propagation/mdl_StatusWords.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "tools/JsonMembers.h"
#include "tools/TextTable.h"

#include <algorithm>
#include <functional>
#include <map>
#include <optional>

using nlohmann::ordered_json;

namespace {

using Cell = ModelHistory::Cell;
/// Puts into a cell whether its step writes the object, and how; empty where only statuses are told.
using MarkOf =
    std::function<void(const cls_Record& object, const cow_String& name, const cow_String& step, Cell& cell)>;

std::vector<ModelHistory::Row> RowsOf(const mdl_Repository& objects, const kprC_StepContainer& steps,
                                      const MarkOf& markOf) {
    std::vector<ModelHistory::Row> rows;
    for (const auto& [name, record] : objects) {
        const auto& object = static_cast<const kprC_PropagatingObject&>(record);
        ModelHistory::Row& row = rows.emplace_back();
        row.name = Text(name);
        row.className = Text(cls_Classes().ShortNameOf(object.DynTypeId()));
        row.suppressed = object.suppressed;
        row.cells.reserve(static_cast<std::size_t>(steps.Size()));
        for (const auto& [step, stepRecord] : steps) {
            Cell& cell = row.cells.emplace_back();
            cell.status = object.StatusIn(step);
            if (markOf != nullptr) markOf(object, name, step, cell);
        }
    }
    return rows;
}

const char* StatusName(mdl_PropagationStatusEnm status) {
    return omu_EnumTableOf(status).Row(static_cast<int>(status))->name;
}

std::string WithFootnote(std::string tables) {
    if (!tables.empty())
        tables +=
            "  (* written in the step, ! with op=NEW; of interactions and output requests only the status)\n";
    return tables;
}

/// What lives across steps and reaches the deck has a history there.
bool HasHistory(const odiK_Repository& repository) {
    return repository.IsPropagating() && repository.ReachesDeck();
}

/// The words of a status, a dash before an object begins, and the mark of a step that writes it.
std::string CellText(const Cell& cell) {
    std::string text = cell.status == mdl_PropagationStatusEnm::NOT_YET_ACTIVE
                           ? "-"
                           : mdl_StatusWords(StatusName(cell.status));
    if (cell.written) text += cell.opNew ? " !" : " *";
    return text;
}

/// The marks of the conditions, by the member of their repository.
class Marks {
public:
    /// What can't be marked is put into `failures`.
    Marks(const oif_ModelInfo& info, std::vector<ModelHistory::Failure>& failures)
        : info_(info), view_(info.Model()), failures_(failures) {
        MarkBoundaryConditions();
        MarkLoads();
        MarkFields();
    }
    MarkOf Of(const char* member) const {
        const auto place = marks_.find(member);
        return place == marks_.end() ? MarkOf() : place->second;
    }

private:
    /// What `configure` makes of a status; nothing, and a failure of the kind, when it raises.
    template <class Status, class Configure>
    std::optional<Status> Configured(const char* member, const Configure& configure) {
        try {
            Status status;
            configure(status);
            return status;
        } catch (const QRXBasException& raised) {
            failures_.push_back({member, raised.what()});
            return std::nullopt;
        }
    }

    void MarkBoundaryConditions() {
        MarkPlaced<kbcC_BC, oif_BCOpStatus>("boundaryConditions", [&](oif_BCOpStatus& status) {
            status = oif_BoundaryConditionBuilder::OpStatusOf(view_.BCs(), view_.Loads(), view_.Steps());
        });
    }

    void MarkLoads() {
        MarkPlaced<kloC_Load, oif_LoadOpStatus>("loads", [&](oif_LoadOpStatus& status) {
            status.Configure(view_.Loads(), view_.Steps().Keys(), info_);
        });
    }

    void MarkFields() {
        MarkPlaced<kpfC_Field, oif_FieldOpStatus>("fields", [&](oif_FieldOpStatus& status) {
            status.Configure(view_.Fields(), view_.Steps().Keys());
        });
    }

    /// Objects that a step writes wherever they have a place in it.
    template <class T, class Status, class Configure>
    void MarkPlaced(const char* member, const Configure& configure) {
        const kprC_StepContainer& steps = view_.Steps();
        const auto status = Configured<Status>(member, configure);
        if (!status) return;
        marks_[member] = [&steps, status](const cls_Record& record, const cow_String& name,
                                          const cow_String& step, Cell& cell) {
            const auto& object = static_cast<const T&>(record);
            cell.isMarked = true;
            for (const oif_ConditionPlace& place :
                 Status::Places(steps.ConstGet(step), name, object.Status(step))) {
                if (!status->Writes(object, step, place.IsLoadCase())) continue;
                cell.written = true;
                cell.opNew = status->Op(object, step, place.IsLoadCase()) == oif_Op::NEW;
            }
        };
    }

    const oif_ModelInfo& info_;
    const qkw_Model& view_;
    std::vector<ModelHistory::Failure>& failures_;
    std::map<std::string, MarkOf, std::less<>> marks_;
};

} // namespace

ModelHistory::ModelHistory(const odb_Odb& odb, const cow_String& modelName) {
    const oif_ModelInfo info(odb.ddb().model(modelName));
    const odiK_Model& model = *odb.FindModel(modelName);
    const kprC_StepContainer& steps = info.Model().Steps();
    for (const auto& [step, record] : steps) steps_.emplace_back(step.View());
    const Marks marks(info, failures_);
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (!HasHistory(repository)) continue;
        kinds_.push_back({&repository, RowsOf(repository.In(model), steps, marks.Of(repository.member))});
    }
}

ordered_json ModelHistory::Json() const {
    ordered_json root = ordered_json::object();
    for (const Failure& failure : failures_) root["failures"][failure.member] = failure.text;
    for (const Kind& kind : kinds_) {
        ordered_json& objects = root[kind.repository->member] = ordered_json::object();
        for (const Row& row : kind.rows) {
            ordered_json states = ordered_json::array();
            for (std::size_t step = 0; step < steps_.size(); ++step) {
                const Cell& cell = row.cells[step];
                ordered_json& state = states.emplace_back(ordered_json::object());
                AddMember(state, "step", steps_[step]);
                AddMember(state, "status", StatusName(cell.status));
                if (!cell.isMarked) continue;
                AddMember(state, "written", cell.written);
                AddMember(state, "opNew", cell.opNew);
            }
            AddMember(
                objects, row.name,
                {{"class", row.className}, {"suppressed", row.suppressed}, {"steps", std::move(states)}});
        }
    }
    return root;
}

std::string ModelHistory::TextOf(const Kind& kind) const {
    if (kind.rows.empty()) return {};
    TextTable table;
    std::vector<std::string> header{""};
    header.insert(header.end(), steps_.begin(), steps_.end());
    table.Row(std::move(header));
    for (const Row& row : kind.rows) {
        std::vector<std::string> cells{row.name + (row.suppressed ? " (suppressed)" : "")};
        cells.reserve(row.cells.size() + 1);
        for (const Cell& cell : row.cells) cells.push_back(CellText(cell));
        table.Row(std::move(cells));
    }
    std::string text = std::string("  history of ") + kind.repository->plural + "\n" + table.Text("    ");
    for (const Failure& failure : failures_) {
        if (failure.member == kind.repository->member)
            text += "    a deck can't tell them: " + failure.text + "\n";
    }
    return text;
}

std::string ModelHistory::Text() const {
    std::string text;
    for (const Kind& kind : kinds_) text += TextOf(kind);
    return WithFootnote(std::move(text));
}

std::map<std::string, std::string> ModelHistory::TextsByKind() const {
    std::map<std::string, std::string> texts;
    for (const Kind& kind : kinds_) texts.emplace(kind.repository->member, WithFootnote(TextOf(kind)));
    return texts;
}
