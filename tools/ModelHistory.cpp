#include "tools/ModelHistory.h"

#include "base/oif_ModelInfo.h"
#include "conditions/oif_BoundaryConditionBuilder.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "tools/FindingText.h"
#include "tools/TextTable.h"

#include <algorithm>
#include <functional>
#include <optional>

using nlohmann::ordered_json;

namespace {

struct Mark {
    bool written;
    bool opNew;
};
template <class T>
using MarkOf = std::function<Mark(const T& object, const cow_String& name, const cow_String& stepName)>;

template <class T>
ordered_json HistoryOf(const kprC_PropagatingContainer<T>& objects, const kprC_StepContainer& steps,
                       const MarkOf<T>& markOf = nullptr) {
    ordered_json all = ordered_json::object();
    for (kprC_PropagatingContainerIT<T> it(objects); !it.IsDone(); it.Next()) {
        const T& object = it.CurrentValue();
        ordered_json states = ordered_json::array();
        for (int i = 0; i < steps.Size(); ++i) {
            const cow_String& step = steps.NameAt(i);
            ordered_json state = {{"step", Text(step)},
                                  {"status", omu_EnumTableOf(mdl_PropagationStatusEnm())
                                                 .Row(static_cast<int>(object.Status(step)))
                                                 ->name}};
            if (markOf != nullptr) {
                const Mark mark = markOf(object, it.CurrentKey(), step);
                state["written"] = mark.written;
                state["opNew"] = mark.opNew;
            }
            states.push_back(std::move(state));
        }
        all[Text(it.CurrentKey())] = {{"class", Text(cls_Classes().NameOf(object.DynTypeId()))},
                                      {"suppressed", object.suppressed},
                                      {"steps", std::move(states)}};
    }
    return all;
}

/// What `configure` gives, or nothing and the text of its failure.
template <class Status, class Configure>
std::optional<Status> Configured(std::string& failure, const Configure& configure) {
    try {
        Status status;
        configure(status);
        return status;
    } catch (const QRXBasException& raised) {
        failure = raised.what();
        return std::nullopt;
    }
}

struct HistoryKind {
    const char* key;
    const char* name;
};
constexpr HistoryKind kKinds[] = {
    {"boundaryConditions", "boundary conditions"},
    {"loads", "loads"},
    {"fields", "fields"},
    {"interactions", "interactions"},
    {"fieldOutputRequests", "field output requests"},
    {"historyOutputRequests", "history output requests"},
};

/// "BUILT_INTO_BASE_STATE" as "built into base state"; a dash before an object begins.
std::string StatusText(const std::string& status) {
    if (status == "NOT_YET_ACTIVE") return "-";
    std::string text;
    for (const char c : status)
        text += c == '_' ? ' ' : static_cast<char>(c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c);
    return text;
}

} // namespace

ordered_json DescribeHistory(const ddb_Model& model) {
    const oif_ModelInfo info(model);
    const qkw_Model& view = info.Model();
    const kprC_StepContainer& steps = view.Steps();
    const auto anyPlace = [](const oif_ConditionPlaces& places, const auto& writes) {
        return std::any_of(places.begin(), places.end(), writes);
    };
    ordered_json root = ordered_json::object();
    std::string failure;
    const auto note = [&](const char* kind) {
        if (!failure.empty()) root["failures"][kind] = failure;
        failure.clear();
    };

    const auto conditions = Configured<oif_BCOpStatus>(failure, [&](oif_BCOpStatus& status) {
        status = oif_BoundaryConditionBuilder::OpStatusOf(view.BCs(), view.Loads(), steps);
    });
    note("boundaryConditions");
    MarkOf<kbcC_BC> markCondition;
    if (conditions) {
        markCondition = [&](const kbcC_BC& bc, const cow_String& name, const cow_String& step) {
            const auto places = oif_BCOpStatus::Places(steps.ConstGet(step), name, bc.Status(step));
            bool inCase = false;
            const bool written = anyPlace(places, [&](const oif_ConditionPlace& place) {
                inCase = !place.loadCase.IsEmpty();
                return conditions->Writes(bc, step, inCase);
            });
            return Mark{written, written && (inCase || conditions->OpNew(bc.DynTypeId(), step))};
        };
    }
    root["boundaryConditions"] = HistoryOf(view.BCs(), steps, markCondition);

    const auto loads = Configured<oif_LoadOpStatus>(
        failure, [&](oif_LoadOpStatus& status) { status.Configure(view.Loads(), steps.Keys(), info); });
    note("loads");
    MarkOf<kloC_Load> markLoad;
    if (loads) {
        markLoad = [&](const kloC_Load& load, const cow_String& name, const cow_String& step) {
            const bool written =
                !oif_LoadOpStatus::Places(steps.ConstGet(step), name).empty() && loads->Writes(load, step);
            return Mark{written, written && loads->OpNew(load.DynTypeId(), step)};
        };
    }
    root["loads"] = HistoryOf(view.Loads(), steps, markLoad);

    const auto fields = Configured<oif_FieldOpStatus>(
        failure, [&](oif_FieldOpStatus& status) { status.Configure(view.Fields(), steps.Keys()); });
    note("fields");
    MarkOf<kpfC_Field> markField;
    if (fields) {
        markField = [&](const kpfC_Field& field, const cow_String& name, const cow_String& step) {
            const bool written =
                !oif_FieldOpStatus::Places(steps.ConstGet(step), name).empty() && fields->Writes(field, step);
            return Mark{written, written && fields->OpNew(field.DynTypeId(), step)};
        };
    }
    root["fields"] = HistoryOf(view.Fields(), steps, markField);

    root["interactions"] = HistoryOf(view.Interactions(), steps);
    root["fieldOutputRequests"] = HistoryOf(view.FieldOutputs(), steps);
    root["historyOutputRequests"] = HistoryOf(view.HistoryOutputs(), steps);
    return root;
}

std::string TextOfHistory(const ordered_json& history) {
    std::string text;
    for (const HistoryKind& kind : kKinds) {
        const ordered_json& objects = history[kind.key];
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
        text += std::string("  history of ") + kind.name + "\n" + table.Text("    ");
        if (history.contains("failures") && history["failures"].contains(kind.key)) {
            text += "    a deck can't tell them: " + history["failures"][kind.key].get<std::string>() + "\n";
        }
    }
    if (!text.empty())
        text +=
            "  (* written in the step, ! with op=NEW; of interactions and output requests only the status)\n";
    return text;
}
