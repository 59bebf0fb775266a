// Model files that are changed as trees, so that most of them are read: each goes the whole way to a deck and
// back.
//     fuzz_whole_way NEW_CORPUS tests/decks examples/...
#include "fuzz/WholeWay.h"
#include "tools/ModelDescription.h"
#include "tools/ModelHistory.h"

#include <nlohmann/json.hpp>

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <random>

extern "C" std::size_t LLVMFuzzerMutate(std::uint8_t* data, std::size_t size, std::size_t maxSize);

namespace {

using Json = nlohmann::ordered_json;

Json Parsed(const std::uint8_t* data, std::size_t size) {
    return Json::parse(data, data + size, nullptr, false, true);
}

class TreeMutator {
public:
    TreeMutator(Json& root, unsigned seed) : random_(seed) { Collect(root, 0); }

    void Change() {
        Json& place = *places_[Upto(places_.size())];
        switch (Upto(8)) {
        case 0: place = AnyNumber(); break;
        case 1: place = AnyText(); break;
        case 2: place = *places_[Upto(places_.size())]; break; // another part of the tree
        case 3:
            if (place.is_structured() && !place.empty())
                place.erase(std::next(place.begin(), Any(place.size())));
            break;
        case 4:
            if (place.is_array() && !place.empty()) place.push_back(Json(place[Upto(place.size())]));
            break;
        case 5:
            if (place.is_object() && !place.empty()) Rename(place);
            break;
        case 6: ChangeScalar(place); break;
        default: ChangeScalar(*scalars_[Upto(scalars_.size())]); break;
        }
    }

private:
    // A null root must do as a place, too.
    void Collect(Json& json, int depth) {
        places_.push_back(&json);
        if (!json.is_structured()) scalars_.push_back(&json);
        if (scalars_.empty()) scalars_.push_back(&json);
        if (depth > 40) return;
        for (Json& item : json) {
            if (json.is_structured()) Collect(item, depth + 1);
        }
    }

    std::size_t Upto(std::size_t count) { return random_() % count; }
    std::ptrdiff_t Any(std::size_t count) { return static_cast<std::ptrdiff_t>(Upto(count)); }

    Json AnyNumber() {
        static const Json numbers[] = {0,
                                       1,
                                       -1,
                                       2,
                                       6,
                                       7,
                                       2147483647,
                                       -2147483648LL,
                                       0.0,
                                       -0.0,
                                       0.5,
                                       1e-300,
                                       1e300,
                                       1.7976931348623157e308,
                                       2.2250738585072014e-308,
                                       3.4e38,
                                       1e39,
                                       4294967296.0};
        return numbers[Upto(std::size(numbers))];
    }
    Json AnyText() {
        static const char* const texts[] = {"",         "x",       "a.b",      "a b",     "\"q\"", "*Step",
                                            "x\n*Step", "\x1b[2J", "\xC3\xA4", "Initial", "1"};
        return texts[Upto(std::size(texts))];
    }

    void ChangeScalar(Json& json) {
        if (json.is_boolean()) {
            json = !json.get<bool>();
        } else if (json.is_number_integer()) {
            json = Upto(3) == 0 ? AnyNumber()
                                : Json(json.get<long long>() + static_cast<long long>(Upto(5)) - 2);
        } else if (json.is_number()) {
            json = Upto(2) == 0 ? AnyNumber() : Json(-json.get<double>());
        } else if (json.is_string()) {
            std::string text = json.get<std::string>();
            switch (Upto(4)) {
            case 0: json = AnyText(); break;
            case 1: json = text + (text.empty() ? "" : text.substr(0, 1)); break;
            case 2: json = *scalars_[Upto(scalars_.size())]; break;
            default: json = nullptr;
            }
        } else {
            json = Upto(2) == 0 ? AnyNumber() : AnyText();
        }
    }

    void Rename(Json& object) {
        Json changed = Json::object();
        const std::size_t renamed = Upto(object.size());
        std::size_t i = 0;
        for (auto& [name, value] : object.items()) {
            changed[i++ == renamed ? AnyText().get<std::string>() : name] = value;
        }
        object = changed;
    }

    std::minstd_rand random_;
    std::vector<Json*> places_;
    std::vector<Json*> scalars_;
};

} // namespace

extern "C" std::size_t LLVMFuzzerCustomMutator(std::uint8_t* data, std::size_t size, std::size_t maxSize,
                                               unsigned seed) {
    Json root = Parsed(data, size);
    if (root.is_discarded() || seed % 50 == 0) return LLVMFuzzerMutate(data, size, maxSize);
    for (unsigned i = 0; i <= seed % 3; ++i) TreeMutator(root, seed + i).Change();
    const std::string text = root.dump(-1, ' ', false, Json::error_handler_t::replace);
    if (text.size() > maxSize) return size;
    std::copy(text.begin(), text.end(), data);
    return text.size();
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    const std::string problem = WholeWay(text);
    if (!problem.empty()) {
        std::fprintf(stderr, "%s\n", problem.c_str());
        std::abort();
    }
    mdf_Report report;
    const auto odb = mdf_ReadModelText(text, "m.json", report);
    if (odb == nullptr) return 0;
    for (const auto& [name, model] : odb->Models()) {
        static_cast<void>(TextOfDescription(std::string(name.View()), DescribeModel(*model)));
        const ModelHistory history(*odb, name);
        static_cast<void>(history.Json());
        static_cast<void>(history.Text());
    }
    return 0;
}
