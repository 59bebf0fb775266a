#include "model_file/mdf_Placement.h"

#include "model_file/mdf_ClassChoice.h"
#include "model_file/mdf_Pointer.h"
#include "model_file/mdf_Schema.h"
#include "store_interface/findings/fnd_Text.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <charconv>
#include <memory>
#include <mutex>
#include <optional>

namespace {

using Json = nlohmann::ordered_json;

constexpr std::string_view kDefinitions = "#/$defs/";
/// In place of a name or a number that may be any.
constexpr const char* kAny = "/...";

/// An object that the schema describes, and where it stands.
struct SchemaPlace {
    const Json* object;
    std::string pointer;
    /// What stands there; null where nothing does, or nobody looked.
    const mdf_Value* value = nullptr;
    /// It is one of several that go by their names.
    bool isNamed = false;
};

const mdf_Value* ChildOf(const mdf_Value* value, const std::string& token) {
    if (value == nullptr) return nullptr;
    if (value->IsObject()) return value->Find(token);
    if (value->Kind() != mdf_Kind::Array) return nullptr;
    std::size_t index = 0;
    std::from_chars(token.data(), token.data() + token.size(), index);
    return index < value->Size() ? &value->Items()[index] : nullptr;
}

bool Has(const Json& object, const std::string& member) {
    return object.contains("properties") && object["properties"].contains(member);
}

/// Whether the file gives the member a plain value there already.
bool IsTaken(const SchemaPlace& place, const std::string& member) {
    const mdf_Value* const value = ChildOf(place.value, member);
    return value != nullptr && !value->IsObject() && !value->IsArray();
}

/// The schema, made when it is first asked for, and anew when a program has added classes.
std::shared_ptr<const Json> KeptSchema() {
    static std::mutex mutex;
    static std::shared_ptr<const Json> kept;
    static std::size_t classes = 0;
    const std::lock_guard<std::mutex> lock(mutex);
    if (kept == nullptr || classes != cls_Classes().All().size()) {
        classes = cls_Classes().All().size();
        kept = std::make_shared<const Json>(mdf_Schema());
    }
    return kept;
}

class Placement {
public:
    explicit Placement(const mdf_Value& root) : root_(root), kept_(KeptSchema()), schema_(*kept_) {}

    /// "is it meant for '/models/...'?" of the member at the pointer, or nothing.
    std::string HintOf(const std::string& pointer) const {
        const std::optional<std::vector<std::string>> tokens = mdf_PointerTokens(pointer);
        if (!tokens || tokens->empty()) return {};
        const std::string& member = tokens->back();
        const std::vector<SchemaPlace> around = PlacesTo({tokens->begin(), tokens->end() - 1});
        // A member that the object may have stands beside one that excludes it.
        if (around.empty() || Has(*around.back().object, member)) return {};
        std::vector<std::string> found = Within(around.back(), member, false);
        for (auto outer = around.rbegin() + 1; found.empty() && outer != around.rend(); ++outer) {
            if (Has(*outer->object, member) && !IsTaken(*outer, member))
                found.push_back(outer->pointer + "/" + member);
        }
        // What stands beside the models has no neighbours in them.
        for (auto outer = around.rbegin() + 1; found.empty() && outer != around.rend(); ++outer) {
            if (!outer->pointer.empty()) found = Within(*outer, member, true);
        }
        if (found.empty() || found.size() > 2) return {};
        return "is it meant for " + fnd_Quoted(found.front()) +
               (found.size() == 2 ? " or " + fnd_Quoted(found.back()) : "") + "?";
    }

private:
    /// What a node stands for: of a choice among classes, the class that the value names.
    const Json* Resolved(const Json& node, const mdf_Value* value) const {
        const auto reference = node.find("$ref");
        if (reference == node.end()) return &node;
        const std::string name = reference->get<std::string>().substr(kDefinitions.size());
        constexpr std::string_view choice = "ANY_";
        if (!name.starts_with(choice)) return Resolved(schema_["$defs"][name], value);
        const mdf_Value* const word = value != nullptr && value->IsObject() ? value->Find("class") : nullptr;
        const cls_ClassEntry* const base =
            cls_Classes().FindByName(std::string_view(name).substr(choice.size()));
        if (word == nullptr || !word->IsString() || base == nullptr) return nullptr;
        const cls_ClassEntry* const entry = mdf_ClassChoice::Of(base->info.Id()).Find(word->String());
        return entry == nullptr ? nullptr : &schema_["$defs"][entry->info.name];
    }

    /// Calls `visit` for each form that a value may have.
    template <class Visitor>
    void ForEachForm(const Json& node, const mdf_Value* value, const Visitor& visit) const {
        const Json* const form = Resolved(node, value);
        if (form == nullptr || !form->is_object()) return;
        if (!form->contains("anyOf")) {
            visit(*form);
            return;
        }
        for (const Json& each : (*form)["anyOf"]) ForEachForm(each, value, visit);
    }

    /// The objects that the tokens lead through, from the outermost on; none when they lead astray.
    std::vector<SchemaPlace> PlacesTo(const std::vector<std::string>& tokens) const {
        std::vector<SchemaPlace> places{{&schema_, {}, &root_}};
        std::vector<const Json*> forms{&schema_};
        std::string pointer;
        const mdf_Value* value = &root_;
        for (const std::string& token : tokens) {
            fnd_AppendPointer(pointer, token);
            value = ChildOf(value, token);
            std::vector<const Json*> inner;
            for (const Json* form : forms) {
                const Json* const child = Has(*form, token)         ? &(*form)["properties"][token]
                                          : form->contains("items") ? &(*form)["items"]
                                                                    : AnyMemberOf(*form);
                if (child != nullptr)
                    ForEachForm(*child, value, [&inner](const Json& each) { inner.push_back(&each); });
            }
            forms = std::move(inner);
            for (const Json* form : forms) {
                if (form->contains("properties")) places.push_back({form, pointer, value});
            }
        }
        if (places.back().pointer != pointer) places.clear();
        return places;
    }

    static const Json* AnyMemberOf(const Json& form) {
        const auto members = form.find("additionalProperties");
        return members == form.end() || !members->is_object() ? nullptr : &*members;
    }

    /// Adds the objects that a value may be or hold; what a class has to be chosen for is left out.
    void AddObjects(std::vector<SchemaPlace>& places, const Json& node, const std::string& pointer,
                    bool isNamed) const {
        // A value with its state holds nothing else.
        constexpr std::string_view withState = "#/$defs/SET_OR_CLEARED.";
        if (node.contains("$ref") && node["$ref"].get<std::string>().starts_with(withState)) return;
        ForEachForm(node, nullptr, [&](const Json& form) {
            if (form.contains("properties"))
                places.push_back({&form, pointer, nullptr, isNamed});
            else if (form.contains("items"))
                AddObjects(places, form["items"], pointer + kAny, false);
            else if (const Json* members = AnyMemberOf(form))
                AddObjects(places, *members, pointer + kAny, true);
        });
    }

    /// The places of the member within the object that need the fewest steps; or, of neighbours, those in
    /// objects that go by their names and have no class: parts and instances.
    std::vector<std::string> Within(const SchemaPlace& place, const std::string& member,
                                    bool ofNeighbours) const {
        constexpr int deepest = 3;
        std::vector<std::string> found;
        std::vector<SchemaPlace> level{place};
        for (int depth = 0; depth < deepest && found.empty(); ++depth) {
            std::vector<SchemaPlace> inner;
            for (const SchemaPlace& outer : level) {
                for (const auto& [name, node] : (*outer.object)["properties"].items())
                    AddObjects(inner, node, outer.pointer + "/" + name, false);
            }
            if (ofNeighbours)
                std::erase_if(inner, [](const SchemaPlace& each) { return Has(*each.object, "class"); });
            for (const SchemaPlace& each : inner) {
                const std::string pointer = each.pointer + "/" + member;
                if (Has(*each.object, member) && (each.isNamed || !ofNeighbours) &&
                    std::ranges::find(found, pointer) == found.end())
                    found.push_back(pointer);
            }
            level = std::move(inner);
        }
        return found;
    }

    const mdf_Value& root_;
    const std::shared_ptr<const Json> kept_;
    const Json& schema_;
};

} // namespace

void mdf_HintPlaces(const mdf_Value& root, std::vector<fnd_Finding>& findings) {
    std::unique_ptr<const Placement> placement;
    constexpr int most = 10;
    int hinted = 0;
    for (fnd_Finding& finding : findings) {
        if (finding.code->name != "unknown-member" || hinted++ >= most) continue;
        if (placement == nullptr) placement = std::make_unique<const Placement>(root);
        std::string hint = placement->HintOf(finding.place);
        if (!hint.empty()) finding.hint = std::move(hint);
    }
}
