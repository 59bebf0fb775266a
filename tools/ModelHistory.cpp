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

struct Mark {
    bool written;
    bool opNew;
};
/// Whether a step writes the object, and how; empty where only statuses are told.
using MarkOf = std::function<Mark(const cls_Record& object, const cow_String& name, const cow_String& step)>;

/// The same by a function of the objects' own class.
template <class T, class Function>
MarkOf MarkOfA(const Function& function) {
    return [function](const cls_Record& object, const cow_String& name, const cow_String& step) {
        return function(static_cast<const T&>(object), name, step);
    };
}

ordered_json HistoryOf(const mdl_Repository& objects, const kprC_StepContainer& steps, const MarkOf& markOf) {
    ordered_json all = ordered_json::object();
    for (const auto& [name, record] : objects) {
        const auto& object = static_cast<const kprC_PropagatingObject&>(record);
        ordered_json states = ordered_json::array();
        for (const auto& [step, stepRecord] : steps) {
            ordered_json state = ordered_json::object();
            AddMember(state, "step", Text(step));
            AddMember(state, "status",
                      omu_EnumTableOf(mdl_PropagationStatusEnm())
                          .Row(static_cast<int>(object.StatusIn(step)))
                          ->name);
            if (markOf != nullptr) {
                const Mark mark = markOf(object, name, step);
                AddMember(state, "written", mark.written);
                AddMember(state, "opNew", mark.opNew);
            }
            states.push_back(std::move(state));
        }
        AddMember(all, Text(name),
                  {{"class", Text(cls_Classes().ShortNameOf(object.DynTypeId()))},
                   {"suppressed", object.suppressed},
                   {"steps", std::move(states)}});
    }
    return all;
}

/// What lives across steps and reaches the deck has a history there.
bool HasHistory(const odiK_Repository& repository) {
    return repository.IsPropagating() && repository.ReachesDeck();
}

/// The words of a status; a dash before an object begins.
std::string StatusText(const std::string& status) {
    return status == "NOT_YET_ACTIVE" ? "-" : mdl_StatusWords(status);
}

/// The marks of the conditions, by the member of their repository.
class Marks {
public:
    Marks(const oif_ModelInfo& info, ordered_json& root) : info_(info), view_(info.Model()), root_(root) {
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
            root_["failures"][member] = raised.what();
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
        marks_[member] =
            MarkOfA<T>([&steps, status](const T& object, const cow_String& name, const cow_String& step) {
                Mark mark{false, false};
                for (const oif_ConditionPlace& place :
                     Status::Places(steps.ConstGet(step), name, object.Status(step))) {
                    if (!status->Writes(object, step, place.IsLoadCase())) continue;
                    mark = {true, status->Op(object, step, place.IsLoadCase()) == oif_Op::NEW};
                }
                return mark;
            });
    }

    const oif_ModelInfo& info_;
    const qkw_Model& view_;
    ordered_json& root_;
    std::map<std::string, MarkOf, std::less<>> marks_;
};

} // namespace

ordered_json DescribeHistory(const odb_Odb& odb, const cow_String& modelName) {
    const oif_ModelInfo info(odb.ddb().model(modelName));
    const odiK_Model& model = *odb.FindModel(modelName);
    ordered_json root = ordered_json::object();
    const Marks marks(info, root);
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (!HasHistory(repository)) continue;
        root[repository.member] =
            HistoryOf(repository.In(model), info.Model().Steps(), marks.Of(repository.member));
    }
    return root;
}

std::string TextOfHistory(const ordered_json& history) {
    std::string text;
    for (const odiK_Repository& kind : odiK_Repositories()) {
        if (!HasHistory(kind)) continue;
        const ordered_json& objects = history[kind.member];
        if (objects.empty()) continue;
        TextTable table;
        for (const auto& [name, object] : objects.items()) {
            if (&object == &objects.front()) {
                std::vector<std::string> header{""};
                for (const ordered_json& state : object["steps"]) header.push_back(state["step"]);
                table.Row(std::move(header));
            }
            std::vector<std::string> row{name + (object["suppressed"].get<bool>() ? " (suppressed)" : "")};
            for (const ordered_json& state : object["steps"]) {
                std::string cell = StatusText(state["status"]);
                if (state.value("written", false)) cell += state["opNew"].get<bool>() ? " !" : " *";
                row.push_back(std::move(cell));
            }
            table.Row(std::move(row));
        }
        text += std::string("  history of ") + kind.plural + "\n" + table.Text("    ");
        if (history.contains("failures") && history["failures"].contains(kind.member)) {
            text +=
                "    a deck can't tell them: " + history["failures"][kind.member].get<std::string>() + "\n";
        }
    }
    if (!text.empty())
        text +=
            "  (* written in the step, ! with op=NEW; of interactions and output requests only the status)\n";
    return text;
}
