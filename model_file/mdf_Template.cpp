#include "model_file/mdf_Template.h"

#include "model_file/mdf_Document.h"
#include "model_file/mdf_Locate.h"
#include "model_file/mdf_ModelReader.h"
#include "model_file/mdf_Parser.h"
#include "model_file/mdf_Pointer.h"
#include "store_interface/model/odiK_ModelRules.h"

#include <algorithm>

namespace {

std::string PointerOf(std::span<const std::string> tokens) {
    std::string pointer;
    for (const std::string& token : tokens) fnd_AppendPointer(pointer, token);
    return pointer;
}

/// Calls `visit(mesh, pointer)` for the meshes of parts and instances, which the shelf keeps.
template <class Visitor>
void ForEachMesh(mdf_Value& root, const Visitor& visit) {
    mdf_Value* models = root.IsObject() ? root.Find("models") : nullptr;
    if (models == nullptr || !models->IsObject()) return;
    const auto owners = [&](mdf_Value* all, const std::string& pointer) {
        if (all == nullptr || !all->IsObject()) return;
        for (mdf_Member& owner : all->Members()) {
            mdf_Value* mesh = owner.value.IsObject() ? owner.value.Find("mesh") : nullptr;
            if (mesh == nullptr) continue;
            std::string place = pointer;
            fnd_AppendPointer(place, owner.name);
            visit(*mesh, place + "/mesh");
        }
    };
    for (mdf_Member& model : models->Members()) {
        if (!model.value.IsObject()) continue;
        std::string pointer = "/models";
        fnd_AppendPointer(pointer, model.name);
        owners(model.value.Find("parts"), pointer + "/parts");
        mdf_Value* assembly = model.value.Find("assembly");
        if (assembly != nullptr && assembly->IsObject())
            owners(assembly->Find("instances"), pointer + "/assembly/instances");
    }
}

/// A copy of the document without the arrays of meshes that no variant changes.
mdf_Value CopyWithoutMeshes(mdf_Value& root, std::span<const std::string> places) {
    std::vector<std::pair<mdf_Value*, mdf_Value>> apart;
    ForEachMesh(root, [&](mdf_Value& mesh, const std::string& pointer) {
        // A given mesh is a number.
        const bool isSmall = !mesh.IsObject() || mesh.Find("file") != nullptr;
        const bool varies = std::ranges::any_of(
            places, [&](const std::string& place) { return fnd_IsBelow(place, pointer); });
        if (!isSmall && !varies) apart.emplace_back(&mesh, std::exchange(mesh, mdf_Value()));
    });
    mdf_Value copy = root;
    for (auto& [place, mesh] : apart) *place = std::move(mesh);
    return copy;
}

bool Same(const fnd_Finding& a, const fnd_Finding& b) {
    return a.code == b.code && a.place == b.place && a.found == b.found;
}

/// What the rules of whole models say of the model, in the way that its reader does.
void AddRules(const odiK_Model& model, fnd_Sink& sink) {
    const fnd_Path top;
    const fnd_Path models(top, "models");
    const fnd_Path place(models, model.Name().View());
    fnd_Below below(sink, place);
    odiK_CheckModelRules(model, below);
}

} // namespace

/// Where a pointer leads.
struct mdf_Template::Target {
    std::vector<std::string> tokens;
    std::string model;
    /// The object that holds the place, when that is one of a repository and can be read alone.
    const odiK_Repository* repository = nullptr;
    std::string object;
    std::string objectPointer;
};

mdf_Template::~mdf_Template() = default;

std::unique_ptr<mdf_Template> mdf_Template::OfFile(const std::string& path, const Places& places,
                                                   mdf_Report& report, const mdf_ModelChoice& choice) {
    std::string text;
    if (!mdf_ReadTold(path, text, report)) return nullptr;
    return OfText(text, path, places, report, {}, choice);
}

std::unique_ptr<mdf_Template> mdf_Template::OfText(std::string_view text, const std::string& fileName,
                                                   const Places& places, mdf_Report& report,
                                                   const mdf_GivenMeshes& given,
                                                   const mdf_ModelChoice& choice) {
    report.fileName = fileName;
    mdf_Value root;
    std::vector<fnd_Finding> errors;
    mdf_Parse(text, root, errors);
    std::unique_ptr<mdf_Template> made(new mdf_Template());
    made->fileName_ = fileName;
    made->given_ = given;
    made->choice_ = choice;
    const bool isRead = made->Read(root, errors, places, report);
    mdf_Locate(text, report.findings);
    return isRead ? std::move(made) : nullptr;
}

bool mdf_Template::Read(mdf_Value& root, std::vector<fnd_Finding>& errors, const Places& places,
                        mdf_Report& report) {
    if (root.IsObject()) {
        // What is wrong with them is told together with all else.
        mdf_Report early;
        mdf_Diagnostics diagnostics(early);
        parameters_ = mdf_ReadParameters(root, diagnostics);
    }
    root_ = CopyWithoutMeshes(root, places(parameters_));
    store_ = mdf_ReadDocument(root, errors, report, &shelf_, given_, choice_);
    if (store_ == nullptr) return false;
    fnd_List rules;
    for (const auto& [name, model] : store_->Models()) AddRules(*model, rules);
    for (const fnd_Finding& finding : report.findings) {
        const bool ofRules =
            std::ranges::any_of(rules.findings, [&](const fnd_Finding& rule) { return Same(rule, finding); });
        if (!ofRules) findings_.push_back(finding);
    }
    timeline_ = std::make_unique<kprC_Timeline>(store_->DeckModel()->steps);
    return true;
}

std::unique_ptr<mdf_Template> mdf_Template::Twin() const {
    std::unique_ptr<mdf_Template> twin(new mdf_Template());
    twin->fileName_ = fileName_;
    twin->parameters_ = parameters_;
    twin->root_ = root_;
    twin->shelf_ = mdf_MeshShelf(shelf_, {});
    twin->given_ = given_;
    twin->choice_ = choice_;
    twin->findings_ = findings_;
    mdf_Value read = root_;
    std::vector<fnd_Finding> errors;
    mdf_Report report;
    report.fileName = fileName_;
    twin->store_ = mdf_ReadDocument(read, errors, report, &twin->shelf_, given_, choice_);
    if (twin->store_ == nullptr) throw std::logic_error("a template that was read can't be read again");
    twin->timeline_ = std::make_unique<kprC_Timeline>(twin->store_->DeckModel()->steps);
    return twin;
}

std::optional<mdf_Template::Problem> mdf_Template::ProblemOf(const std::string& pointer) const {
    const std::optional<std::vector<std::string>> tokens = mdf_PointerTokens(pointer);
    if (!tokens || tokens->size() < 3 || tokens->front() != "models")
        return Problem{"found " + fnd_Quoted(pointer), "a JSON pointer to a value of a model", {}};
    std::vector<std::string> names;
    const int wrong = mdf_FirstWrongToken(root_, *tokens, &names);
    if (wrong < 0) return std::nullopt;
    const auto place = static_cast<std::size_t>(wrong);
    const std::string& token = (*tokens)[place];
    std::string hint = fnd_DidYouMean(token, names);
    if (hint.empty() && place + 1 == tokens->size() && !names.empty())
        hint = "give it a value in the template, which rows then replace";
    return Problem{"found no " + fnd_Quoted(token) + " in " +
                       fnd_Quoted(PointerOf(std::span(*tokens).first(place))) + " of the template",
                   "the place of a value", std::move(hint)};
}

const mdf_Template::Target& mdf_Template::TargetOf(const std::string& pointer) {
    std::unique_ptr<Target>& known = targets_[pointer];
    if (known != nullptr) return *known;
    known = std::make_unique<Target>();
    known->tokens = mdf_PointerTokens(pointer).value();
    const std::vector<std::string>& tokens = known->tokens;
    known->model = tokens[1];
    // The class of an object decides what may refer to it.
    constexpr std::size_t ofObject = 4;
    if (known->model != store_->DeckModelName().View() || tokens.size() <= ofObject ||
        tokens[ofObject] == "class")
        return *known;
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (repository.IsInOrder() || tokens[2] != repository.member) continue;
        known->repository = &repository;
        known->object = tokens[3];
        known->objectPointer = PointerOf(std::span(tokens).first(ofObject));
    }
    return *known;
}

std::unique_ptr<odb_Odb> mdf_Template::Variant(std::span<const mdf_Change> changes, mdf_Report& report) {
    std::vector<const Target*> targets;
    bool ofObjects = true;
    for (const mdf_Change& change : changes) {
        targets.push_back(&TargetOf(change.pointer));
        ofObjects = ofObjects && targets.back()->repository != nullptr;
    }
    report.fileName = fileName_;
    if (ofObjects) {
        if (std::unique_ptr<odb_Odb> store = VariantOfObjects(changes, targets, report)) return store;
        // Reading all tells of errors what it would of the file itself.
        report = {};
        report.fileName = fileName_;
    }
    return VariantOfModels(changes, targets, report);
}

std::unique_ptr<odb_Odb> mdf_Template::VariantOfObjects(std::span<const mdf_Change> changes,
                                                        std::span<const Target* const> targets,
                                                        mdf_Report& report) {
    mdf_Diagnostics diagnostics(report);
    std::map<std::string, std::pair<const Target*, mdf_Value>> objects;
    constexpr std::size_t ofObject = 4;
    for (std::size_t i = 0; i < changes.size(); ++i) {
        const std::span<const std::string> tokens(targets[i]->tokens);
        const auto [place, isNew] = objects.try_emplace(targets[i]->objectPointer, targets[i], mdf_Value());
        if (isNew) {
            const mdf_Value* value = &root_;
            for (const std::string& token : tokens.first(ofObject)) value = value->Find(token);
            place->second.second = *value;
        }
        mdf_PutAt(place->second.second, tokens.subspan(ofObject), changes[i].value);
    }
    for (const fnd_Finding& finding : findings_) {
        const bool ofChanged = std::ranges::any_of(
            objects, [&](const auto& object) { return fnd_IsBelow(finding.place, object.first); });
        if (!ofChanged) diagnostics.Take(finding);
    }
    auto store = std::make_unique<odb_Odb>();
    const cow_String& name = store_->DeckModelName();
    odiK_Model& model = store->AddModel(name);
    store->SetDeckModelName(name);
    model.Share(*store_->DeckModel());
    const fnd_Path top;
    const fnd_Path models(top, "models");
    const fnd_Path ofModel(models, name.View());
    for (const auto& [pointer, object] : objects) {
        const Target& target = *object.first;
        const fnd_Path container(ofModel, std::string_view(target.repository->member));
        mdf_ModelReader(model, diagnostics, given_)
            .ReadAnew(*target.repository, target.object, object.second, fnd_Path(container, target.object),
                      *timeline_);
    }
    AddRules(model, diagnostics);
    return diagnostics.NumErrors() > 0 ? nullptr : std::move(store);
}

std::unique_ptr<odb_Odb> mdf_Template::VariantOfModels(std::span<const mdf_Change> changes,
                                                       std::span<const Target* const> targets,
                                                       mdf_Report& report) {
    mdf_Diagnostics diagnostics(report);
    std::vector<std::string> pointers;
    std::map<std::string, mdf_Value> models;
    models.emplace(std::string(store_->DeckModelName().View()), mdf_Value());
    for (std::size_t i = 0; i < changes.size(); ++i) {
        pointers.push_back(changes[i].pointer);
        models.emplace(targets[i]->model, mdf_Value());
    }
    for (auto& [name, json] : models) json = *root_.Find("models")->Find(name);
    for (std::size_t i = 0; i < changes.size(); ++i) {
        mdf_PutAt(models[targets[i]->model], std::span<const std::string>(targets[i]->tokens).subspan(2),
                  changes[i].value);
    }
    for (const fnd_Finding& finding : findings_) {
        const bool readAnew = std::ranges::any_of(models, [&](const auto& model) {
            std::string pointer = "/models";
            fnd_AppendPointer(pointer, model.first);
            return fnd_IsBelow(finding.place, pointer);
        });
        if (!readAnew) diagnostics.Take(finding);
    }
    auto store = std::make_unique<odb_Odb>();
    store->SetDeckModelName(store_->DeckModelName());
    mdf_MeshShelf shelf(shelf_, pointers);
    const fnd_Path top;
    const fnd_Path path(top, "models");
    for (auto& [name, json] : models) {
        mdf_ModelReader reader(store->AddModel(cow_String(name)), diagnostics, given_);
        reader.TakeFrom(shelf);
        reader.Read(json, fnd_Path(path, name));
    }
    return diagnostics.NumErrors() > 0 ? nullptr : std::move(store);
}
