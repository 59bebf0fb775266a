#include "mesh_file/msf_Builder.h"
#include "mesh_file/msf_Readers.h"

#include <algorithm>
#include <charconv>

namespace {

/// A dataset: its number, and where its content stands.
struct Dataset {
    int number;
    std::size_t begin;
};

bool IsOneOf(int number, std::initializer_list<int> numbers) {
    return std::find(numbers.begin(), numbers.end(), number) != numbers.end();
}

/// Datasets of nodes with two lines each, of nodes with one, of elements, and of groups, whose members have
/// two numbers in the older ones and four in the newer.
constexpr std::initializer_list<int> kNodes = {2411, 781};
constexpr std::initializer_list<int> kOldNodes = {15};
constexpr std::initializer_list<int> kElements = {2412, 780, 71};
constexpr std::initializer_list<int> kOldGroups = {752, 2417, 2429, 2430, 2432};
constexpr std::initializer_list<int> kGroups = {2435, 2452, 2467, 2477};
/// Elements with a line of orientation nodes, and those that no cell stands for: rigid ones, springs, gaps.
constexpr std::initializer_list<int> kBeams = {11, 21, 22, 23, 24};
constexpr std::initializer_list<int> kNoCells = {121, 122, 136, 137, 138, 139, 141, 142, 151, 152};

constexpr int kNodeMember = 7;
constexpr int kElementMember = 8;

class UnvReader {
public:
    UnvReader(std::string_view bytes, const msf_Options& options, msf_Mesh& mesh)
        : bytes_(bytes), at_(bytes), builder_(mesh, options) {}

    void Read();

private:
    std::vector<Dataset> Datasets();
    /// Calls with each dataset of the numbers; the cursor stands at its content.
    template <class F>
    void ForEach(const std::vector<Dataset>& all, std::initializer_list<int> numbers, const F& read);
    void ReadNodes(bool oneLine);
    void ReadElements();
    void ReadElement(const std::vector<long long>& head);
    void ReadGroups(bool fourNumbers);
    void ReadMembers(const std::string& name, long long count, bool fourNumbers);
    /// The whole numbers of the next line that isn't blank.
    const std::vector<long long>& Numbers(const char* expected);

    std::string_view bytes_;
    msf_Cursor at_;
    msf_Builder builder_;
    std::vector<long long> numbers_;
    std::vector<int> row_;
    long long numNoCells_ = 0;
    long long numOtherMembers_ = 0;
    long long numNoElements_ = 0;
};

void UnvReader::Read() {
    builder_.Mesh().format = "UNV";
    const std::vector<Dataset> datasets = Datasets();
    ForEach(datasets, kNodes, [this] { ReadNodes(false); });
    ForEach(datasets, kOldNodes, [this] { ReadNodes(true); });
    builder_.FinishNodes(at_);
    ForEach(datasets, kElements, [this] { ReadElements(); });
    builder_.FinishCells(at_);
    ForEach(datasets, kOldGroups, [this] { ReadGroups(false); });
    ForEach(datasets, kGroups, [this] { ReadGroups(true); });
    if (numNoCells_ > 0)
        builder_.Note(msf_Counted(numNoCells_, "rigid, spring or gap element") + " were left out");
    if (numOtherMembers_ > 0)
        builder_.Note(msf_Counted(numOtherMembers_, "member") +
                      " of groups are neither nodes nor elements and were left out");
    if (numNoElements_ > 0)
        builder_.Note(msf_Counted(numNoElements_, "member") +
                      " of groups are elements that the file doesn't have, or that were left out");
}

std::vector<Dataset> UnvReader::Datasets() {
    std::vector<Dataset> found;
    while (true) {
        const std::string_view line = at_.NextLine();
        if (line.empty()) return found;
        if (line != "-1") at_.FailAtWord("found " + msf_Shown(line), "-1, which begins a dataset");
        const std::string_view number = at_.NextLine();
        if (number.empty()) return found;
        Dataset dataset{0, at_.At()};
        const auto [end, error] =
            std::from_chars(number.data(), number.data() + number.size(), dataset.number);
        // Binary datasets ("58b") have none of what is wanted here, but can't be passed over by lines.
        if (error != std::errc() || end != number.data() + number.size())
            at_.FailAtWord("found " + msf_Shown(number), "the number of a dataset");
        found.push_back(dataset);
        // The end is a line of its own.
        while (true) {
            if (at_.AtEnd())
                at_.Fail("found the end of the file in dataset " + std::to_string(dataset.number),
                         "-1 at its end");
            const std::string_view text = at_.Line();
            const std::size_t first = text.find_first_not_of(' ');
            if (first == std::string_view::npos || text[first] != '-') continue;
            if (text.substr(first, 2) == "-1" &&
                text.find_first_not_of(" \t", first + 2) == std::string_view::npos)
                break;
        }
    }
}

template <class F>
void UnvReader::ForEach(const std::vector<Dataset>& all, std::initializer_list<int> numbers, const F& read) {
    for (const Dataset& dataset : all) {
        if (!IsOneOf(dataset.number, numbers)) continue;
        at_.MoveTo(dataset.begin);
        read();
    }
}

void UnvReader::ReadNodes(bool oneLine) {
    while (true) {
        const long long label = at_.Int("the label of a node, or -1");
        if (label == -1) return;
        msf_Builder::Label(at_, label, "a node");
        for (int i = 0; i < 3; ++i) at_.Int("a number of a node's first line");
        double point[3];
        for (double& value : point) value = at_.Real("a coordinate");
        builder_.AddNode(at_, label, point[0], point[1], point[2]);
        if (oneLine) at_.Line();
    }
}

const std::vector<long long>& UnvReader::Numbers(const char* expected) {
    numbers_.clear();
    const std::string_view line = at_.NextLine();
    const char* at = line.data();
    const char* const end = line.data() + line.size();
    while (at != end) {
        if (*at == ' ' || *at == '\t') {
            ++at;
            continue;
        }
        long long number = 0;
        const auto [next, error] = std::from_chars(at, end, number);
        if (error != std::errc()) at_.FailAtWord("found " + msf_Shown(line), expected);
        numbers_.push_back(number);
        at = next;
    }
    if (numbers_.empty()) at_.FailAtWord("found the end of the file", expected);
    return numbers_;
}

void UnvReader::ReadElements() {
    constexpr const char* kHead = "the first line of an element: label, type, ..., number of nodes";
    while (true) {
        const std::vector<long long>& head = Numbers(kHead);
        if (head.front() == -1 && head.size() == 1) return;
        if (head.size() < 5)
            at_.FailAtWord("found " + msf_Counted(static_cast<long long>(head.size()), "number"), kHead);
        ReadElement(head);
    }
}

void UnvReader::ReadElement(const std::vector<long long>& head) {
    const long long label = msf_Builder::Label(at_, head.front(), "an element");
    const long long type = head[1];
    const long long count = head.back();
    const bool noCell = type > 0 && type < 1000 && IsOneOf(static_cast<int>(type), kNoCells);
    const msf_NodeOrder* order = msf_FindNodeOrder(msf_FormatEnm::UNV, type, count);
    if (order == nullptr && !noCell) {
        at_.FailAtWord("found an element of type " + std::to_string(type),
                       "a line, triangle, quadrangle, tetrahedron, wedge or brick of first or second order");
    }
    if (order != nullptr && count != order->nodes) {
        at_.FailAtWord("found " + msf_Counted(count, "node") + " of an element of type " +
                           std::to_string(type),
                       std::to_string(order->nodes));
    }
    if (count < 0 || count > 1000) at_.FailAtWord("found " + std::to_string(count) + " nodes", "a few");
    if (IsOneOf(static_cast<int>(type), kBeams)) at_.Line();
    row_.clear();
    for (long long i = 0; i < count; ++i) {
        const long long node = at_.Int("the label of a node");
        // A spring may end at the ground.
        row_.push_back(noCell ? 0 : builder_.Node(at_, node));
    }
    if (noCell) {
        ++numNoCells_;
    } else {
        builder_.AddCell(at_, *order, label, row_.data());
    }
}

void UnvReader::ReadGroups(bool fourNumbers) {
    constexpr const char* kHead = "the first line of a group: number, ..., number of members";
    while (true) {
        const std::vector<long long>& head = Numbers(kHead);
        if (head.front() == -1 && head.size() == 1) return;
        const long long number = head.front();
        const long long count = head.back();
        if (head.size() < 2 || count < 0 || static_cast<unsigned long long>(count) > bytes_.size()) {
            at_.FailAtWord("found a group of " + msf_Counted(count, "member"), kHead);
        }
        std::string name = msf_Builder::NameOf(at_.Line());
        if (name.empty()) {
            name = "GROUP_" + std::to_string(number);
            builder_.Note("group " + std::to_string(number) + " has no name and was named " + name);
        }
        ReadMembers(name, count, fourNumbers);
    }
}

void UnvReader::ReadMembers(const std::string& name, long long count, bool fourNumbers) {
    if (count == 0) builder_.Note("group " + msf_Shown(name) + " has no members and was left out");
    for (long long i = 0; i < count; ++i) {
        const long long kind = at_.Int("the kind of a member");
        const long long label = at_.Int("the label of a member");
        if (fourNumbers) {
            at_.Int("a number of a member");
            at_.Int("a number of a member");
        }
        int block = 0;
        int place = 0;
        if (kind == kNodeMember) {
            builder_.Group(name, 0).nodes.push_back(builder_.Node(at_, label));
        } else if (kind != kElementMember) {
            ++numOtherMembers_;
        } else if (builder_.FindCell(label, block, place)) {
            builder_.AddToGroup(name, block, place);
        } else {
            // Some meshers name points here that they write no elements for.
            ++numNoElements_;
        }
    }
}

} // namespace

bool msf_IsUnv(std::string_view bytes) {
    msf_Cursor at(bytes.substr(0, 4096));
    if (at.PeekWord() != "-1") return false;
    at.NextLine();
    const std::string_view number = at.PeekWord();
    return !number.empty() && number.size() <= 6 &&
           number.find_first_not_of("0123456789bB") == std::string_view::npos;
}

void msf_ReadUnv(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh) {
    UnvReader(input.bytes, options, mesh).Read();
}
