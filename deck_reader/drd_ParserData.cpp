#include "deck_reader/drd_Parser.h"
#include "deck_reader/drd_Text.h"

#include <algorithm>

namespace {

/// More labels than that are no set.
constexpr std::int64_t kMostGenerated = 200'000'000;

/// An empty field: goes on behind its comma.
bool PassEmptyField(const char*& at) {
    return drd_EndOfField(at, at);
}

/// The field at `at` as it stands, trimmed; `at` goes on behind its comma.
std::string_view PassField(const char*& at) {
    const char* end = at;
    bool quoted = false;
    for (; *end != '\n' && *end != '\r' && *end != '\0' && (quoted || *end != ','); ++end) {
        if (*end == '"') quoted = !quoted;
    }
    const std::string_view field(at, static_cast<std::size_t>(end - at));
    at = *end == ',' ? end + 1 : nullptr;
    return drd_Trim(field);
}

/// Nothing but blanks up to the end of the line.
bool IsAtEnd(const char* at) {
    return at == nullptr || (PassEmptyField(at) && at == nullptr);
}

int IndexOf(std::string_view name, drd_TextMap& index, std::vector<std::string>& names) {
    const auto [place, isNew] = index.TryEmplace(name, static_cast<int>(names.size()));
    if (isNew) names.emplace_back(name);
    return place;
}

} // namespace

drd_Mesh& drd_Parser::CurrentMesh() {
    drd_Block& block = deck_.blocks[static_cast<std::size_t>(Last().block)];
    if (block.mesh < 0) {
        block.mesh = static_cast<int>(deck_.meshes.size());
        deck_.meshes.emplace_back();
    }
    return deck_.meshes[static_cast<std::size_t>(block.mesh)];
}

void drd_Parser::AddPlace(std::vector<drd_PlaceRun>& runs, std::uint64_t record, drd_Place place) {
    if (!runs.empty() && runs.back().file == place.file) {
        drd_PlaceRun& run = runs.back();
        const auto records = static_cast<std::int64_t>(record - run.first);
        const std::int64_t lines = place.line - run.line;
        if (lines == records * run.stride) return;
        if (records == 1 && lines > 0 && lines < 1'000'000'000) {
            run.stride = static_cast<std::int32_t>(lines);
            return;
        }
    }
    runs.push_back({record, place.line, place.file, 1});
}

void drd_Parser::WrongNumber(std::string_view line, const char* expected) {
    if (findings_.Wants("not-a-number")) {
        findings_.Add("not-a-number", Here(), drd_Shown(line), expected);
    } else {
        findings_.Add("not-a-number", {}, {});
    }
}

void drd_Parser::BeginNodes() {
    drd_Mesh& mesh = CurrentMesh();
    mesh.nodeRuns.push_back({mesh.nodes.Size(), 0, static_cast<int>(deck_.keywords.size()) - 1});
    AddOwnSet(drd_KindEnm::NODE_SET, "nset");
    bulk_ = &drd_Parser::Nodes;
}

void drd_Parser::Nodes(std::string_view line) {
    drd_Mesh& mesh = CurrentMesh();
    do {
        NodeLine(mesh, line);
    } while (NextDataLine(line));
    mesh.nodeRuns.back().count = mesh.nodes.Size() - mesh.nodeRuns.back().first;
}

void drd_Parser::NodeLine(drd_Mesh& mesh, std::string_view line) {
    const char* at = line.data();
    int label = 0;
    double point[3] = {0.0, 0.0, 0.0};
    if (!drd_ScanInt(at, label)) {
        if (!drd_Trim(line).empty()) WrongNumber(line, "a node: label, x, y, z");
        return;
    }
    for (double& coordinate : point) {
        if (at == nullptr) break;
        if (drd_ScanReal(at, coordinate) || PassEmptyField(at)) continue;
        WrongNumber(line, "a node: label, x, y, z");
        PassField(at);
    }
    if (label < 1) {
        findings_.Add("label-not-positive", Here(), "node " + std::to_string(label));
        return;
    }
    if (at != nullptr && !IsAtEnd(at))
        findings_.Add("node-columns", Here(), drd_Shown(line), "label, x, y, z");
    AddPlace(mesh.nodePlaces, mesh.nodes.Size(), Here());
    mesh.nodes.Add(label);
    mesh.coordinates.Add(point, 3);
}

/// The set that nodes or elements name in their own keyword line.
void drd_Parser::AddOwnSet(drd_KindEnm kind, std::string_view parameter) {
    const drd_Keyword& keyword = Last();
    if (keyword.Find(parameter) == nullptr) return;
    drd_SetPart part;
    part.kind = kind;
    part.keyword = static_cast<int>(deck_.keywords.size()) - 1;
    part.block = keyword.block;
    part.name = NameOf(keyword.Value(parameter));
    part.first = deck_.labels.Size();
    deck_.setParts.push_back(part);
}

void drd_Parser::BeginElements() {
    AddOwnSet(drd_KindEnm::ELEMENT_SET, "elset");
    const drd_Keyword& keyword = Last();
    CurrentMesh();
    const std::string type = drd_NameOf(keyword.Value("type"));
    if (type.empty())
        findings_.Add("element-without-type", keyword.Place(), "elements without a type", "type=");
    type_ = IndexOf(type, typeIndex_, deck_.types);
    nodesOfType_ = options_.typeInfo == nullptr ? 0 : options_.typeInfo(type).maxNodes;
    bulk_ = &drd_Parser::Elements;
}

void drd_Parser::Elements(std::string_view line) {
    drd_Mesh& mesh = CurrentMesh();
    const int keyword = static_cast<int>(deck_.keywords.size()) - 1;
    bool goesOn = true;
    while (goesOn) {
        const std::uint64_t firstNode = mesh.connectivity.Size();
        const std::uint64_t element = mesh.elements.Size();
        goesOn = ElementRecord(mesh, line);
        if (mesh.elements.Size() > element) {
            const int nodes = static_cast<int>(mesh.connectivity.Size() - firstNode);
            if (mesh.elementRuns.empty() || mesh.elementRuns.back().keyword != keyword ||
                mesh.elementRuns.back().nodes != nodes) {
                mesh.elementRuns.push_back({element, 0, firstNode, nodes, type_, keyword});
            }
            ++mesh.elementRuns.back().count;
        }
        // The record ended ahead of a line that it has looked at, or behind its last.
        goesOn = goesOn && NextDataLine(line);
    }
}

/// Reads one element with all its lines; false when no line of the block is left.
bool drd_Parser::ElementRecord(drd_Mesh& mesh, std::string_view line) {
    const char* at = line.data();
    int label = 0;
    if (!drd_ScanInt(at, label)) {
        if (!drd_Trim(line).empty()) WrongNumber(line, "an element: label, nodes");
        return true;
    }
    const std::uint64_t firstNode = mesh.connectivity.Size();
    const drd_Place place = Here();
    bool hasLines = true;
    for (;;) {
        if (!ElementNodes(mesh, at)) {
            WrongNumber(line, "an element: label, nodes");
            break;
        }
        const std::string_view text = drd_Trim(line);
        const auto nodes = static_cast<int>(mesh.connectivity.Size() - firstNode);
        // Behind as many nodes as the type has, a comma is one too many; of a record that has more, it is one
        // of its own.
        const bool goesOn =
            !text.empty() && text.back() == ',' && (nodesOfType_ <= 0 || nodes != nodesOfType_);
        if (!goesOn) break;
        hasLines = NextDataLine(line);
        if (!hasLines) break;
        at = line.data();
    }
    if (!mesh.owners.IsEmpty()) {
        while (mesh.owners.Size() < mesh.connectivity.Size()) mesh.owners.Add(-1);
    }
    if (label < 1) {
        findings_.Add("label-not-positive", place, "element " + std::to_string(label));
        mesh.connectivity.Cut(firstNode);
        mesh.owners.Cut(firstNode);
        return hasLines;
    }
    AddPlace(mesh.elementPlaces, mesh.elements.Size(), place);
    mesh.elements.Add(label);
    return hasLines;
}

/// The nodes on one line.
bool drd_Parser::ElementNodes(drd_Mesh& mesh, const char* at) {
    int node = 0;
    while (at != nullptr) {
        if (drd_ScanInt(at, node)) {
            mesh.connectivity.Add(node);
        } else if (!PassEmptyField(at) && !NodeOfInstance(mesh, at)) {
            return false;
        }
    }
    return true;
}

/// A node of another instance: INSTANCE.LABEL.
bool drd_Parser::NodeOfInstance(drd_Mesh& mesh, const char*& at) {
    const std::string name = drd_NameOf(PassField(at));
    const std::size_t dot = name.rfind('.');
    int node = 0;
    if (dot == std::string::npos || !drd_ReadInt(std::string_view(name).substr(dot + 1), node)) return false;
    while (mesh.owners.Size() < mesh.connectivity.Size()) mesh.owners.Add(-1);
    mesh.connectivity.Add(node);
    mesh.owners.Add(IndexOf(std::string_view(name).substr(0, dot), ownerIndex_, deck_.owners));
    return true;
}

void drd_Parser::BeginSet(drd_KindEnm kind) {
    drd_Keyword& keyword = Last();
    keyword.set = static_cast<int>(deck_.setParts.size());
    drd_SetPart part;
    part.kind = kind;
    part.keyword = static_cast<int>(deck_.keywords.size()) - 1;
    part.block = keyword.block;
    part.name = NameOf(keyword.Value(kind == drd_KindEnm::NODE_SET ? "nset" : "elset"));
    part.instance = NameOf(keyword.Value("instance"));
    part.isGenerated = keyword.Find("generate") != nullptr;
    part.first = deck_.labels.Size();
    deck_.setParts.push_back(part);
    bulk_ = &drd_Parser::SetLines;
}

void drd_Parser::SetLines(std::string_view line) {
    drd_SetPart& part = deck_.setParts.back();
    members_.clear();
    do {
        if (part.isGenerated) {
            GeneratedLine(line);
        } else {
            SetLine(line);
        }
    } while (NextDataLine(line));
    part.count = deck_.labels.Size() - part.first;
    part.members = deck_.texts.Keep(members_);
}

void drd_Parser::SetLine(std::string_view line) {
    const char* at = line.data();
    int label = 0;
    while (at != nullptr) {
        if (drd_ScanInt(at, label)) {
            if (label > 0) {
                deck_.labels.Add(label);
            } else {
                findings_.Add("label-not-positive", Here(), "member " + std::to_string(label));
            }
        } else if (!PassEmptyField(at)) {
            const std::string_view member = PassField(at);
            if (std::count(member.begin(), member.end(), '"') % 2 != 0) {
                findings_.Add("quote-left-open", Here(), drd_Shown(member), "a second double quote");
            }
            members_.push_back(deck_.texts.Keep(member));
        }
    }
}

void drd_Parser::GeneratedLine(std::string_view line) {
    if (drd_Trim(line).empty()) return;
    const char* at = line.data();
    int range[3] = {0, 0, 1};
    bool isRight = drd_ScanInt(at, range[0]) && at != nullptr && drd_ScanInt(at, range[1]);
    if (isRight && at != nullptr) isRight = drd_ScanInt(at, range[2]) || PassEmptyField(at);
    if (!isRight) {
        WrongNumber(line, "a range: first, last, step");
        return;
    }
    const std::int64_t count = (std::int64_t{range[1]} - range[0]) / std::max(range[2], 1) + 1;
    if (range[0] < 1 || range[2] < 1 || range[1] < range[0] || count > kMostGenerated) {
        findings_.Add("range-endless", Here(), drd_Shown(line),
                      "first, last, step in this order, from 1 upward");
        return;
    }
    deck_.labels.Add(range, 3);
}
