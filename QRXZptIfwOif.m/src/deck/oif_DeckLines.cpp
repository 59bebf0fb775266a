#include "deck/oif_DeckLines.h"

#include "deck/oif_Builder.h"
#include "store_interface/model/odb_Odb.h"

#include <algorithm>
#include <map>
#include <string_view>
#include <tuple>

namespace {

struct Kind {
    std::string_view repository;
    /// What the builders call its objects.
    std::string_view made;
};
constexpr Kind kKinds[] = {
    {"steps", "step"}, {"constraints", "constraint"}, {"boundaryConditions", "boundary condition"},
    {"loads", "load"}, {"fields", "field"},           {"interactions", "interaction"}};

const Kind* FindKind(std::string_view repository) {
    const auto* place =
        std::ranges::find_if(kKinds, [&](const Kind& kind) { return kind.repository == repository; });
    return place == std::end(kKinds) ? nullptr : place;
}

} // namespace

/// Keeps what the keywords were made from, and finds them by object and step.
class oif_DeckLines::Run {
public:
    explicit Run(const odb_Odb& odb)
        : info_(odb.ddb().model(odb.DeckModelName())), builder_(info_), log_(builder_.BuildLogged()) {
        const cow_String initial = info_.Model().InitialStepName();
        // A deck has the model's section ahead of the initial step's.
        for (const bool ofModel : {true, false}) {
            for (const qkw_Filed& filed : log_) {
                if (filed.step.IsEmpty() != ofModel) continue;
                const cow_String& step = ofModel ? initial : filed.step;
                places_[{filed.kind, filed.name, step}].push_back(&filed);
            }
        }
    }

    std::vector<oif_ObjectLines> Of(std::string_view kind, const cow_String& name,
                                    const cow_String& step) const {
        std::vector<oif_ObjectLines> lines;
        const auto place = places_.find({kind, name, step});
        if (place == places_.end()) return lines;
        for (const qkw_Filed* filed : place->second) {
            auto into = std::ranges::find_if(
                lines, [&](const oif_ObjectLines& known) { return known.loadCase == filed->loadCase; });
            if (into == lines.end()) into = lines.insert(into, oif_ObjectLines{filed->loadCase, {}});
            into->text += TextOf(filed->keyword.ConstGet());
        }
        std::erase_if(lines, [](const oif_ObjectLines& empty) { return empty.text.empty(); });
        return lines;
    }

private:
    using Key = std::tuple<std::string_view, cow_String, cow_String>;

    static std::string TextOf(const qkw_Keyword& keyword) {
        qio_StringDevice device;
        utl_Stream stream(device, oif_Builder::LineLimit, oif_Builder::Precision, oif_Builder::Precision);
        keyword.Write(stream);
        stream.Flush();
        return device.Text();
    }

    oif_ModelInfo info_;
    oif_Builder builder_;
    qkw_FilingLog log_;
    std::map<Key, std::vector<const qkw_Filed*>> places_;
};

oif_DeckLines::oif_DeckLines(const odb_Odb& odb) : run_(std::make_unique<const Run>(odb)) {}

oif_DeckLines::~oif_DeckLines() = default;

bool oif_DeckLines::Knows(const std::string& repository) {
    return FindKind(repository) != nullptr;
}

std::vector<oif_ObjectLines> oif_DeckLines::Of(const std::string& repository, const cow_String& name,
                                               const cow_String& step) const {
    const Kind* kind = FindKind(repository);
    return kind == nullptr ? std::vector<oif_ObjectLines>() : run_->Of(kind->made, name, step);
}
