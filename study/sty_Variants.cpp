#include "study/sty_Variants.h"

#include "deck/oif_Writer.h"
#include "deck_checks/dck_Check.h"
#include "foundation/nex_Exception.h"
#include "model_file/mdf_Diagnostics.h"
#include "model_file/mdf_Pointer.h"
#include "store_interface/model/odiK_IgnoreList.h"
#include "study/sty_Json.h"

#include <algorithm>

namespace {

constexpr std::size_t kMostErrors = 20;

/// Calls `take` for each number of a value.
template <class Taker>
bool AllNumbers(const mdf_Value& value, const Taker& take) {
    if (value.IsNumber()) return take(value.Real());
    if (!value.IsArray()) return false;
    for (std::size_t i = 0; i < value.Size(); ++i) {
        if (!AllNumbers(value.Item(i), take)) return false;
    }
    return true;
}

/// Pointers so that each stands right behind those that it lies below.
bool Before(std::string_view a, std::string_view b) {
    const auto rank = [](char c) { return c == '/' ? -1 : static_cast<int>(static_cast<unsigned char>(c)); };
    return std::ranges::lexicographical_compare(a, b, {}, rank, rank);
}

void TakeErrors(const mdf_Report& report, const std::vector<sty_Columns::Change>& changes,
                const sty_Columns& columns, sty_Result& result) {
    for (const fnd_Finding& finding : report.findings) {
        if (!finding.IsError() || result.errors.size() >= kMostErrors) continue;
        // The column whose place the finding is about, or lies around it.
        const auto blamed = std::ranges::find_if(changes, [&](const sty_Columns::Change& change) {
            return fnd_IsBelow(finding.place, change.change.pointer);
        });
        const std::string column = blamed == changes.end() ? "" : columns.NameOf(blamed->column);
        result.errors.push_back({column, finding.place, finding.Text()});
    }
}

} // namespace

sty_Columns::sty_Columns(const std::vector<std::string>& columns, bool inAllRows,
                         const std::vector<mdf_Parameter>& parameters) {
    std::vector<std::string> names;
    names.reserve(parameters.size());
    for (const mdf_Parameter& parameter : parameters) names.push_back(parameter.name);
    for (const std::string& name : columns) {
        Column& column = columns_.emplace_back();
        column.name = name;
        if (name == sty_Table::kNameColumn) continue;
        if (name.starts_with('/')) {
            column.pointers.push_back(name);
            continue;
        }
        const auto parameter = std::ranges::find(parameters, name, &mdf_Parameter::name);
        if (parameter != parameters.end()) {
            column.pointers = parameter->pointers;
            column.range = parameter->range;
            column.limits = parameter->limits;
            column.unit = parameter->unit;
            continue;
        }
        const std::string hint = fnd_DidYouMean(name, names);
        column.problem = "found a column " + fnd_Quoted(name) +
                         ", expected \"name\", a JSON pointer or a parameter of the template" +
                         (hint.empty() ? "" : "; " + hint);
        if (inAllRows && problem_.empty()) problem_ = column.problem;
    }
    FindConflicts(inAllRows);
}

void sty_Columns::FindConflicts(bool refuse) {
    std::vector<std::pair<std::string_view, int>> places;
    for (std::size_t i = 0; i < columns_.size(); ++i) {
        for (const std::string& pointer : columns_[i].pointers)
            places.emplace_back(pointer, static_cast<int>(i));
    }
    std::ranges::stable_sort(places, Before, [](const auto& place) { return place.first; });
    std::size_t above = 0;
    for (std::size_t i = 1; i < places.size(); ++i) {
        if (!fnd_IsBelow(places[i].first, places[above].first)) {
            above = i;
            continue;
        }
        conflicts_.emplace_back(places[above].second, places[i].second);
    }
    if (!refuse || conflicts_.empty() || !problem_.empty()) return;
    const auto [first, second] = conflicts_.front();
    problem_ = "the columns " + fnd_Quoted(NameOf(first)) + " and " + fnd_Quoted(NameOf(second)) +
               " change one place of the template";
}

std::vector<std::string> sty_Columns::Pointers() const {
    std::vector<std::string> pointers;
    for (const Column& column : columns_)
        pointers.insert(pointers.end(), column.pointers.begin(), column.pointers.end());
    return pointers;
}

std::string sty_Columns::ProblemOf(const Column& column, const sty_Cell& cell) {
    if (!column.problem.empty()) return column.problem;
    if (cell.value.IsObject()) return "found an object, expected a JSON scalar or array";
    if (column.limits.empty()) return {};
    double wrong = 0.0;
    bool outside = false;
    const bool numbers = AllNumbers(cell.value, [&](double number) {
        if (!outside && !column.range.Allow(number)) {
            outside = true;
            wrong = number;
        }
        return true;
    });
    const std::string expected = column.limits + (column.unit.empty() ? "" : " " + column.unit);
    if (!numbers) return "found " + mdf_Shown(cell.value) + ", expected a number, " + expected;
    return outside ? "found " + (cell.value.IsNumber() ? mdf_Shown(cell.value) : fnd_Shown(wrong)) +
                         ", expected " + expected
                   : std::string();
}

std::vector<sty_Columns::Change> sty_Columns::ChangesOf(const sty_Row& row, const mdf_Template& base,
                                                        sty_Result& result) const {
    std::vector<Change> changes;
    result.row = row.number;
    result.name = row.name;
    result.parameters = "{";
    std::set<int> given;
    for (const sty_Cell& cell : row.cells) {
        const Column& column = columns_[static_cast<std::size_t>(cell.column)];
        if (result.parameters.size() > 1) result.parameters += ", ";
        sty_AppendQuoted(result.parameters, column.name);
        result.parameters.append(": ").append(cell.json);
        if (!conflicts_.empty()) given.insert(cell.column);
        if (std::string problem = ProblemOf(column, cell); !problem.empty()) {
            result.errors.push_back({column.name, {}, std::move(problem)});
            continue;
        }
        for (const std::string& pointer : column.pointers) {
            const auto problem = base.ProblemOf(pointer);
            if (!problem) {
                changes.push_back({cell.column, {pointer, cell.value}});
                continue;
            }
            const std::string hint = problem->hint.empty() ? "" : "; " + problem->hint;
            result.errors.push_back(
                {column.name, pointer, problem->found + ", expected " + problem->expected + hint});
        }
    }
    result.parameters += '}';
    for (const auto& [first, second] : conflicts_) {
        if (!given.contains(first) || !given.contains(second)) continue;
        result.errors.push_back(
            {NameOf(second), {}, "changes the place that " + fnd_Quoted(NameOf(first)) + " changes too"});
    }
    if (!row.problem.empty()) result.errors.push_back({row.problemColumn, {}, row.problem});
    return changes;
}

sty_Variants::sty_Variants(std::unique_ptr<mdf_Template> base, sty_MeshTexts& meshes)
    : template_(std::move(base)), meshes_(meshes), text_(meshes) {}

std::unique_ptr<sty_Variants> sty_Variants::Twin() const {
    return std::make_unique<sty_Variants>(template_->Twin(), meshes_);
}

std::string sty_Variants::KeyOf(const fnd_Finding& finding) {
    return std::string(finding.code->name) + "\n" + finding.place + "\n" + finding.Text();
}

std::vector<fnd_Finding> sty_Variants::Baseline() {
    return CheckDeck(template_->Store());
}

void sty_Variants::LeaveOut(const std::vector<fnd_Finding>& findings) {
    for (const fnd_Finding& finding : findings) leftOut_.insert(KeyOf(finding));
}

void sty_Variants::CheckMeshes(const odb_Odb& store, fnd_Sink& sink) {
    const odiK_Model& model = *store.DeckModel();
    const auto check = [&](const cow_CountedHld<odiK_Mesh>& mesh, std::string_view member,
                           const cow_String& name) {
        if (mesh.IsNull()) return;
        std::string place("/models");
        fnd_AppendPointer(place, store.DeckModelName().View());
        place += member;
        fnd_AppendPointer(place, name.View());
        place += "/mesh";
        Quality& known = qualities_[place];
        if (!(known.mesh == mesh)) {
            fnd_List list;
            dck_CheckMesh(*mesh, place, list);
            known = {mesh, std::move(list.findings)};
        }
        for (const fnd_Finding& finding : known.findings) sink.Take(finding);
    };
    for (const auto& [name, part] : model.Parts()) check(part->mesh, "/parts", name);
    for (const auto& [name, instance] : model.Instances())
        check(instance->ownMesh, "/assembly/instances", name);
}

bool sty_Variants::SharesWithBase(const odb_Odb& store) const {
    return store.DeckModel()->SharesWith(*template_->Store().DeckModel());
}

template <class Kept, class Work>
const Kept* sty_Variants::Keep(std::optional<std::unique_ptr<const Kept>>& kept, const odb_Odb& store,
                               const Work& work) {
    if (!kept && SharesWithBase(store)) {
        kept.emplace();
        try {
            kept = work(template_->Store());
        } catch (const QRXBasException&) {
            // Rows may mend what the template raises; then nothing is kept.
        }
    }
    return kept ? kept->get() : nullptr;
}

std::vector<fnd_Finding> sty_Variants::CheckDeck(const odb_Odb& store) {
    fnd_List list;
    const cow_String& name = store.DeckModelName();
    const dck_Kept* kept = Keep(
        keptChecks_, store, [&](const odb_Odb& base) { return dck_KeepChecks(base, base.DeckModelName()); });
    if (kept != nullptr) {
        dck_CheckDeck(store, name, *kept, list);
    } else {
        dck_CheckDeck(store, name, list);
    }
    CheckMeshes(store, list);
    return std::move(list.findings);
}

void sty_Variants::WriteDeck(const odb_Odb& store) {
    const oif_KeptDeck* kept = Keep(keptDeck_, store, [this](const odb_Odb& base) {
        text_.Begin();
        return oif_Writer(base).Keep(text_);
    });
    text_.Begin();
    oif_Writer writer(store);
    if (kept != nullptr) return writer.WriteInput(text_, *kept);
    writer.WriteInput(static_cast<oif_MeshTexts&>(text_));
}

sty_Result sty_Variants::Make(const sty_Row& row, const sty_Columns& columns) {
    sty_Result result;
    std::vector<sty_Columns::Change> changes = columns.ChangesOf(row, *template_, result);
    if (!result.IsDone()) return result;
    std::vector<mdf_Change> values;
    values.reserve(changes.size());
    for (sty_Columns::Change& change : changes) values.push_back(change.change);
    mdf_Report report;
    const std::unique_ptr<odb_Odb> store = template_->Variant(values, report);
    if (store == nullptr) {
        TakeErrors(report, changes, columns, result);
        if (result.errors.empty()) result.errors.push_back({{}, {}, "the variant can't be read"});
        return result;
    }
    std::vector<fnd_Finding> findings = std::move(report.findings);
    try {
        for (fnd_Finding& finding : CheckDeck(*store)) findings.push_back(std::move(finding));
        WriteDeck(*store);
    } catch (const QRXBasException& failure) {
        const std::string context = failure.Context();
        result.errors.push_back({{}, {}, failure.what() + (context.empty() ? "" : " (" + context + ")")});
    }
    odiK_IgnoreList(*store).TakeFrom(findings);
    std::erase_if(findings, [&](const fnd_Finding& finding) { return leftOut_.contains(KeyOf(finding)); });
    result.findings = std::move(findings);
    if (!result.IsDone()) return result;
    for (std::string& file : report.variantMeshFiles)
        result.meshes.emplace_back(std::move(file), std::string());
    result.bytes = text_.Bytes();
    return result;
}
