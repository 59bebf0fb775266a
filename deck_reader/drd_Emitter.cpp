#include "deck_reader/drd_Emitter.h"

#include "deck_reader/drd_Names.h"
#include "deck_reader/drd_Text.h"
#include "foundation/num_RealText.h"

#include <algorithm>
#include <charconv>

namespace {

constexpr std::size_t kFlushBytes = std::size_t{1} << 16;
/// A keyword line longer than this goes on in the next.
constexpr std::size_t kKeywordBytes = 100;
constexpr std::size_t kNumbersALine = 16;
/// A range of more labels stays a range.
constexpr std::int64_t kMostListed = 1000;

} // namespace

void drd_Emitter::Flush() {
    device_.Write(text_.data(), text_.size());
    text_.clear();
}

void drd_Emitter::EndLine() {
    text_.push_back('\n');
    if (text_.size() >= kFlushBytes) Flush();
}

void drd_Emitter::Line(std::string_view text) {
    text_.append(text);
    EndLine();
}

void drd_Emitter::Int(int value) {
    char digits[16];
    const auto result = std::to_chars(digits, digits + sizeof digits, value);
    text_.append(digits, result.ptr);
}

std::string drd_Emitter::Real(double value, int digits) {
    std::string text(num_RealRoom(0, digits), '\0');
    text.resize(static_cast<std::size_t>(num_WriteReal(text.data(), value, 0, digits) - text.data()));
    return text;
}

void drd_Emitter::Keyword(std::string_view name, std::span<const drd_Parameter> parameters) {
    std::size_t begin = text_.size();
    // Two stars would make a comment.
    text_.append(name.starts_with("*") ? "* " : "*").append(name);
    for (const drd_Parameter& parameter : parameters) {
        text_.append(", ");
        // What begins with anything but a letter would be a line of data there.
        if (text_.size() - begin > kKeywordBytes && !parameter.Name().empty() &&
            drd_IsLetter(parameter.Name().front())) {
            text_.push_back('\n');
            begin = text_.size();
        }
        text_.append(parameter.Name());
        if (parameter.HasValue()) text_.append("=").append(parameter.value);
    }
    EndLine();
}

void drd_Emitter::Node(int label, const double (&point)[3]) {
    constexpr int kDigits = 9;
    Int(label);
    for (const double coordinate : point) {
        text_.append(", ");
        char number[num_RealRoom(0, kDigits)];
        text_.append(number, num_WriteReal(number, coordinate, 0, kDigits));
    }
    EndLine();
}

void drd_Emitter::Element(int label, std::span<const int> nodes) {
    Int(label);
    std::size_t place = 1;
    for (const int node : nodes) {
        text_.push_back(',');
        if (place++ % kNumbersALine == 0) EndLine();
        text_.push_back(' ');
        Int(node);
    }
    EndLine();
}

void drd_Emitter::Labels(std::span<const int> labels) {
    for (std::size_t i = 0; i < labels.size(); ++i) {
        Int(labels[i]);
        const bool isLast = i + 1 == labels.size();
        if (isLast || (i + 1) % kNumbersALine == 0) {
            // A lone number has a comma behind it.
            if (isLast && i % kNumbersALine == 0) text_.push_back(',');
            EndLine();
        } else {
            text_.append(", ");
        }
    }
}

void drd_Emitter::Member(std::string_view name) {
    // A star ahead would make it a keyword.
    Line((name.starts_with("*") ? drd_QuotedName(drd_NameOf(name)) : std::string(name)) + ",");
}

namespace {

class Reformatter {
public:
    Reformatter(const drd_Deck& deck, qio_ostream& device) : deck_(deck), emitter_(device) {}

    void Run() {
        for (const drd_Keyword& keyword : deck_.keywords) Keyword(keyword);
    }

private:
    void Keyword(const drd_Keyword& keyword) {
        std::vector<drd_Parameter> parameters(keyword.Parameters().begin(), keyword.Parameters().end());
        values_.Clear();
        const bool isListed = keyword.set >= 0 && List(deck_.setParts[static_cast<std::size_t>(keyword.set)]);
        std::erase_if(parameters, [isListed](const drd_Parameter& p) {
            return p.Name().empty() || (isListed && p.Key() == "generate");
        });
        std::stable_sort(parameters.begin(), parameters.end(),
                         [](const auto& a, const auto& b) { return a.Key() < b.Key(); });
        for (drd_Parameter& parameter : parameters) {
            if (parameter.HasValue() && !IsName(keyword, parameter))
                parameter.value = values_.Keep(Value(parameter.value));
        }
        const std::string name(keyword.Row() != nullptr ? keyword.Row()->name
                                                        : std::string_view(keyword.Name()));
        emitter_.Keyword(name, parameters);
        if (keyword.IsBulk()) {
            Bulk(keyword);
            return;
        }
        const bool isText = keyword.HasText() || keyword.Row() == nullptr;
        for (std::uint64_t i = 0; i < keyword.lines; ++i) {
            emitter_.Line(isText ? std::string(deck_.DataLine(keyword, i)) : Fields(keyword, i));
        }
    }

    // Names stay as they stand: "01" is another one than "1".
    static bool IsByName(drd_RefEnm ref) {
        return ref != drd_RefEnm::NAME_UNLESS_NUMBER && ref != drd_RefEnm::NODES_UNLESS_NUMBER;
    }
    static bool IsName(const drd_Keyword& keyword, const drd_Parameter& parameter) {
        const std::string_view key = parameter.Key();
        if (key == "elset" || key == "nset") return true;
        if (keyword.Row() != nullptr && key == drd_NameParameter(*keyword.Row())) return true;
        return std::ranges::any_of(parameter.word->parameterRefs, [&](const drd_ParameterRef& ref) {
            return IsByName(ref.ref) && drd_Applies(ref, keyword);
        });
    }
    static bool IsName(const drd_Keyword& keyword, std::uint64_t line, int column) {
        return std::ranges::any_of(keyword.word->dataRefs, [&](const drd_DataRef& ref) {
            return IsByName(ref.ref) && drd_Applies(ref, keyword, line, column);
        });
    }

    static std::string Value(std::string_view value) {
        double number = 0.0;
        int whole = 0;
        if (drd_ReadInt(value, whole)) return std::to_string(whole);
        return drd_ReadReal(value, number) ? drd_Shown(number) : std::string(value);
    }

    std::string Fields(const drd_Keyword& keyword, std::uint64_t line) {
        drd_SplitFields(deck_.DataLine(keyword, line), fields_);
        std::string text;
        for (std::size_t column = 0; column < fields_.size(); ++column) {
            const std::string_view field = fields_[column];
            text += IsName(keyword, line, static_cast<int>(column)) ? std::string(field) : Value(field);
            text += ", ";
        }
        while (!text.empty() && text.back() == ' ') text.pop_back();
        if (fields_.size() > 1 && !text.empty()) text.pop_back();
        // A star ahead would make it a keyword.
        return text.starts_with("*") ? " " + text : text;
    }

    void Bulk(const drd_Keyword& keyword) {
        const int index = static_cast<int>(&keyword - deck_.keywords.data());
        const drd_Mesh* mesh = deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(keyword.block)]);
        if (keyword.Key() == "node" && mesh != nullptr) {
            Nodes(*mesh, index);
        } else if (keyword.Key() == "element" && mesh != nullptr) {
            Elements(*mesh, index);
        } else if (keyword.set >= 0) {
            Set(deck_.setParts[static_cast<std::size_t>(keyword.set)]);
        }
    }

    void Nodes(const drd_Mesh& mesh, int keyword) {
        auto run = std::lower_bound(mesh.nodeRuns.begin(), mesh.nodeRuns.end(), keyword,
                                    [](const drd_NodeRun& r, int of) { return r.keyword < of; });
        for (; run != mesh.nodeRuns.end() && run->keyword == keyword; ++run) {
            for (std::uint64_t i = run->first; i < run->first + run->count; ++i) {
                const double* p = mesh.coordinates.Data() + 3 * i;
                emitter_.Line(std::to_string(mesh.nodes[i]) + ", " + drd_Shown(p[0]) + ", " +
                              drd_Shown(p[1]) + ", " + drd_Shown(p[2]));
            }
        }
    }

    void Elements(const drd_Mesh& mesh, int keyword) {
        auto run = std::lower_bound(mesh.elementRuns.begin(), mesh.elementRuns.end(), keyword,
                                    [](const drd_ElementRun& r, int of) { return r.keyword < of; });
        for (; run != mesh.elementRuns.end() && run->keyword == keyword; ++run) {
            const auto nodes = static_cast<std::size_t>(run->nodes);
            for (std::uint64_t i = 0; i < run->count; ++i) {
                const std::uint64_t first = run->firstNode + i * nodes;
                if (mesh.owners.IsEmpty()) {
                    emitter_.Element(mesh.elements[run->first + i], mesh.connectivity.Part(first, nodes));
                } else {
                    OwnedElement(mesh, mesh.elements[run->first + i], first, nodes);
                }
            }
        }
    }

    void OwnedElement(const drd_Mesh& mesh, int label, std::uint64_t first, std::size_t nodes) {
        std::string line = std::to_string(label);
        for (std::uint64_t n = first; n < first + nodes; ++n) {
            line += (n - first + 1) % kNumbersALine == 0 ? ",\n" : ", ";
            const int owner = mesh.owners[n];
            if (owner >= 0) line += drd_QuotedName(deck_.owners[static_cast<std::size_t>(owner)]) + ".";
            line += std::to_string(mesh.connectivity[n]);
        }
        emitter_.Line(line);
    }

    /// Whether the ranges of a set are short enough to be listed, which `listed_` then is.
    bool List(const drd_SetPart& part) {
        listed_.clear();
        if (!part.isGenerated) return false;
        for (std::uint64_t i = part.first; i + 2 < part.first + part.count; i += 3) {
            const int step = deck_.labels[i + 2];
            if ((std::int64_t{deck_.labels[i + 1]} - deck_.labels[i]) / step > kMostListed) return false;
            for (std::int64_t label = deck_.labels[i]; label <= deck_.labels[i + 1]; label += step) {
                listed_.push_back(static_cast<int>(label));
            }
        }
        return true;
    }

    void Set(const drd_SetPart& part) {
        if (!part.isGenerated) {
            emitter_.Labels(deck_.labels.Part(part.first, part.count));
        } else if (List(part)) {
            emitter_.Labels(listed_);
        } else {
            for (std::uint64_t i = part.first; i + 2 < part.first + part.count; i += 3) {
                emitter_.Labels(deck_.labels.Part(i, 3));
            }
        }
        for (const drd_Word member : part.members) emitter_.Member(member);
    }

    const drd_Deck& deck_;
    drd_Emitter emitter_;
    drd_Texts values_; // of the keyword that is being written
    std::vector<std::string_view> fields_;
    std::vector<int> listed_;
};

} // namespace

void drd_Reformat(const drd_Deck& deck, qio_ostream& device) {
    Reformatter(deck, device).Run();
}
