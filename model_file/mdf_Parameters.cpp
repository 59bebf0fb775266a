#include "model_file/mdf_Parameters.h"

#include "foundation/num_ReadReal.h"
#include "model_file/mdf_Members.h"
#include "model_file/mdf_Pointer.h"
#include "model_file/mdf_Writer.h"

#include <algorithm>
#include <charconv>

namespace {

constexpr const char* kExpectedLimits = "limits such as \"> 0, <= 20\" or \"0.5 .. 20\"";

std::string_view Trimmed(std::string_view text) {
    const auto isBlank = [](char c) { return c == ' ' || c == '\t'; };
    while (!text.empty() && isBlank(text.front())) text.remove_prefix(1);
    while (!text.empty() && isBlank(text.back())) text.remove_suffix(1);
    return text;
}

std::optional<double> NumberOf(std::string_view text) {
    text = Trimmed(text);
    double value = 0.0;
    const auto [end, error] = num_ReadReal(text.data(), text.data() + text.size(), value);
    if (error != std::errc() || end != text.data() + text.size() || !(value - value == 0.0))
        return std::nullopt;
    return value;
}

/// "> 0", "<= 20": one end of the range; false for anything else and for an end that is there already.
bool TakeComparison(std::string_view text, mdf_Limits& limits) {
    text = Trimmed(text);
    if (text.empty() || (text.front() != '<' && text.front() != '>')) return false;
    std::optional<mdf_Limits::Bound>& bound = text.front() == '>' ? limits.low : limits.high;
    if (bound) return false;
    text.remove_prefix(1);
    const bool inclusive = text.starts_with('=');
    if (inclusive) text.remove_prefix(1);
    const std::optional<double> value = NumberOf(text);
    if (value) bound = {*value, inclusive};
    return value.has_value();
}

bool TakeSpan(std::string_view text, std::size_t dots, mdf_Limits& limits) {
    const std::string_view ends[] = {Trimmed(text.substr(0, dots)), Trimmed(text.substr(dots + 2))};
    std::optional<mdf_Limits::Bound>* const bounds[] = {&limits.low, &limits.high};
    for (int i = 0; i < 2; ++i) {
        if (ends[i].empty()) continue;
        const std::optional<double> value = NumberOf(ends[i]);
        if (!value) return false;
        *bounds[i] = {*value, true};
    }
    return limits.low || limits.high;
}

/// Reads one parameter; what is wrong is told.
class ParameterReader {
public:
    ParameterReader(const mdf_Value& root, mdf_Diagnostics& diagnostics)
        : root_(root), diagnostics_(diagnostics) {}

    mdf_Parameter Read(const mdf_Member& member, const fnd_Path& path) {
        mdf_Parameter parameter;
        parameter.name = member.name;
        CheckName(member.name, path);
        const mdf_Value& value = member.value;
        if (!value.IsObject()) {
            ReadPointers(parameter, value, path);
            return parameter;
        }
        mdf_CheckMembers(diagnostics_, value, {"pointers", "unit", "limits", "description"}, path);
        const fnd_Path pointers(path, "pointers");
        if (const mdf_Value* given = value.Find("pointers")) {
            ReadPointers(parameter, *given, pointers);
        } else {
            diagnostics_.Add("missing-field", pointers, "found nothing", "a JSON pointer, or several");
        }
        ReadText(parameter.unit, value, "unit", path);
        ReadText(parameter.limits, value, "limits", path);
        ReadText(parameter.description, value, "description", path);
        if (parameter.limits.empty()) return parameter;
        if (const std::optional<mdf_Limits> range = mdf_Limits::Of(parameter.limits)) {
            parameter.range = *range;
        } else {
            diagnostics_.Add("wrong-value", fnd_Path(path, "limits"), "found " + fnd_Quoted(parameter.limits),
                             kExpectedLimits);
        }
        return parameter;
    }

private:
    void CheckName(const std::string& name, const fnd_Path& path) {
        // A column of a table is a pointer, the name of the deck or a parameter.
        if (!name.empty() && name.front() != '/' && name != "name") return;
        diagnostics_.Add("wrong-value", path, "found a parameter named " + fnd_Quoted(name),
                         "another name: columns of tables that begin with \"/\" are pointers, and \"name\" "
                         "names the decks");
    }

    void ReadText(std::string& text, const mdf_Value& value, const char* member, const fnd_Path& path) {
        const mdf_Value* given = value.Find(member);
        if (given == nullptr) return;
        if (given->IsString()) {
            text = given->String();
        } else {
            diagnostics_.Expected(fnd_Path(path, std::string_view(member)), *given, "a string");
        }
    }

    void ReadPointers(mdf_Parameter& parameter, const mdf_Value& value, const fnd_Path& path) {
        if (value.IsArray() && !value.Empty()) {
            for (std::size_t i = 0; i < value.Size(); ++i)
                ReadPointer(parameter, value.Item(i), fnd_Path(path, i));
        } else {
            ReadPointer(parameter, value, path);
        }
    }

    void ReadPointer(mdf_Parameter& parameter, const mdf_Value& value, const fnd_Path& path) {
        constexpr std::string_view models = "/models/";
        std::optional<std::vector<std::string>> tokens;
        if (value.IsString() && value.String().starts_with(models))
            tokens = mdf_PointerTokens(value.String());
        if (!tokens) {
            diagnostics_.Expected(path, value, "a JSON pointer that begins with \"/models/\", or several");
            return;
        }
        parameter.pointers.push_back(value.String());
        std::vector<std::string> names;
        const int wrong = mdf_FirstWrongToken(root_, *tokens, &names);
        if (wrong < 0) return;
        const std::string& token = (*tokens)[static_cast<std::size_t>(wrong)];
        diagnostics_.Add("no-such-place", path,
                         "found no " + fnd_Quoted(token) + " on the way of " + fnd_Quoted(value.String()),
                         "a pointer to a value of this file", fnd_DidYouMean(token, names));
    }

    const mdf_Value& root_;
    mdf_Diagnostics& diagnostics_;
};

} // namespace

std::optional<mdf_Limits> mdf_Limits::Of(std::string_view text) {
    mdf_Limits limits;
    const std::size_t dots = text.find("..");
    if (dots != std::string_view::npos) {
        if (!TakeSpan(text, dots, limits)) return std::nullopt;
    } else {
        for (;;) {
            const std::size_t comma = text.find(',');
            if (!TakeComparison(text.substr(0, comma), limits)) return std::nullopt;
            if (comma == std::string_view::npos) break;
            text.remove_prefix(comma + 1);
        }
    }
    if (limits.low && limits.high && !(limits.low->value <= limits.high->value)) return std::nullopt;
    return limits;
}

bool mdf_Limits::Allow(double value) const {
    if (low && !(low->inclusive ? value >= low->value : value > low->value)) return false;
    return !high || (high->inclusive ? value <= high->value : value < high->value);
}

std::vector<mdf_Parameter> mdf_ReadParameters(const mdf_Value& root, mdf_Diagnostics& diagnostics) {
    std::vector<mdf_Parameter> parameters;
    const mdf_Value* json = root.Find("parameters");
    if (json == nullptr) return parameters;
    const fnd_Path top;
    const fnd_Path path(top, "parameters");
    if (!json->IsObject()) {
        diagnostics.Expected(path, *json, "an object of parameters by name");
        return parameters;
    }
    ParameterReader reader(root, diagnostics);
    for (const mdf_Member& member : json->Members())
        parameters.push_back(reader.Read(member, fnd_Path(path, member.name)));
    return parameters;
}

void mdf_WriteParameters(mdf_Writer& out, const std::vector<mdf_Parameter>& parameters) {
    if (parameters.empty()) return;
    out.Key("parameters");
    out.BeginObject();
    for (const mdf_Parameter& parameter : parameters) {
        out.Key(parameter.name);
        out.BeginObject();
        out.Key("pointers");
        if (parameter.pointers.size() == 1) {
            out.String(parameter.pointers.front());
        } else {
            out.BeginArray();
            for (const std::string& pointer : parameter.pointers) out.String(pointer);
            out.EndArray();
        }
        const std::pair<const char*, const std::string*> texts[] = {{"unit", &parameter.unit},
                                                                    {"limits", &parameter.limits},
                                                                    {"description", &parameter.description}};
        for (const auto& [key, text] : texts) {
            if (text->empty()) continue;
            out.Key(key);
            out.String(*text);
        }
        out.EndObject();
    }
    out.EndObject();
}
