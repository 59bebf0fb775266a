#include "model_file/mdf_Locate.h"

#include "model_file/mdf_Parser.h"
#include "model_file/mdf_Token.h"
#include "platform/plt_Files.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <filesystem>
#include <map>
#include <set>

namespace {

constexpr std::string_view kMark = "\xEF\xBB\xBF";

/// The findings by the tokens of their places.
struct PlaceNode {
    std::map<std::string, PlaceNode, std::less<>> children;
    std::vector<std::size_t> findings;
};

std::string Unescaped(std::string_view token) {
    std::string text;
    for (std::size_t i = 0; i < token.size(); ++i) {
        const bool escape = token[i] == '~' && i + 1 < token.size();
        text += !escape ? token[i] : token[++i] == '1' ? '/' : '~';
    }
    return text;
}

void EnterPlace(PlaceNode& root, std::string_view pointer, std::size_t finding) {
    PlaceNode* node = &root;
    while (pointer.starts_with('/')) {
        const std::size_t next = std::min(pointer.find('/', 1), pointer.size());
        node = &node->children[Unescaped(pointer.substr(1, next - 1))];
        pointer.remove_prefix(next);
    }
    node->findings.push_back(finding);
}

/// Walks a document that is known to be good.
class DocumentWalker {
public:
    explicit DocumentWalker(std::string_view text, std::size_t at = 0) : text_(text), at_(at) {
        if (at_ == 0 && text_.starts_with(kMark)) at_ = kMark.size();
        SkipBlanks();
    }

    std::size_t At() const { return std::min(at_, text_.size()); }
    char Peek() const { return at_ < text_.size() ? text_[at_] : '\0'; }

    /// Calls `visit(name)` at the name of each member; it has to pass over the name and the value.
    template <class Visitor>
    void ForEachMember(const Visitor& visit) {
        ForEachIn([&](std::size_t) { visit(Name()); });
    }
    /// Calls `visit(index)` at each item, or at the name of each member; it has to pass over it.
    template <class Visitor>
    void ForEachIn(const Visitor& visit) {
        ++at_;
        SkipBlanks();
        for (std::size_t i = 0; at_ < text_.size() && Peek() != ']' && Peek() != '}'; ++i) {
            visit(i);
            if (Peek() == ',') ++at_;
            SkipBlanks();
        }
        ++at_;
        SkipBlanks();
    }
    /// Passes over the name of a member and the colon.
    void PassName() {
        SkipString();
        SkipBlanks();
        ++at_;
        SkipBlanks();
    }
    void PassValue() {
        std::size_t depth = 0;
        do {
            const char c = Peek();
            if (c == '"') {
                SkipString();
            } else if (c == '/') {
                SkipBlanks();
            } else {
                if (c == '[' || c == '{') ++depth;
                if (c == ']' || c == '}') --depth;
                ++at_;
            }
            if (depth > 0) at_ = NextOfInterest();
        } while (at_ < text_.size() && (depth > 0 || IsInScalar()));
        SkipBlanks();
    }

private:
    /// Strings, comments, arrays and objects; what lies between is mostly millions of numbers.
    std::size_t NextOfInterest() const {
        static constexpr auto kOfInterest = [] {
            std::array<bool, 256> table{};
            for (const char c : {'"', '/', '[', ']', '{', '}'}) table[static_cast<unsigned char>(c)] = true;
            return table;
        }();
        const char* const begin = text_.data() + std::min(at_, text_.size());
        const char* const found = std::find_if(begin, text_.data() + text_.size(), [](char c) {
            return kOfInterest[static_cast<unsigned char>(c)];
        });
        return static_cast<std::size_t>(found - text_.data());
    }
    bool IsInScalar() const {
        return std::string_view(",]} \t\r\n/").find(Peek()) == std::string_view::npos &&
               std::string_view("]}\"").find(text_[at_ - 1]) == std::string_view::npos;
    }
    std::string Name() const {
        std::string name;
        for (std::size_t i = at_ + 1; i < text_.size() && text_[i] != '"';) {
            const std::size_t escape = text_[i] == '\\' ? mdf_ReadEscape(text_.substr(i), name) : 0;
            if (escape == 0) name += text_[i];
            i += std::max<std::size_t>(escape, 1);
        }
        return name;
    }
    void SkipString() {
        for (++at_; at_ < text_.size() && text_[at_] != '"'; ++at_) {
            if (text_[at_] == '\\') ++at_;
        }
        ++at_;
    }
    void SkipBlanks() { at_ = mdf_SkipBlanksAndComments(text_, at_); }

    std::string_view text_;
    std::size_t at_;
};

class PlaceFinder {
public:
    PlaceFinder(std::string_view text, std::vector<std::size_t>& offsets)
        : walker_(text), offsets_(offsets) {}

    void Find(const PlaceNode& root) {
        Assign(root, walker_.At());
        Descend(root);
    }

private:
    void Assign(const PlaceNode& node, std::size_t offset) {
        for (const std::size_t finding : node.findings) offsets_[finding] = offset;
        for (const auto& [token, child] : node.children) Assign(child, offset);
    }
    void Descend(const PlaceNode& node) {
        if (node.children.empty() || (walker_.Peek() != '{' && walker_.Peek() != '[')) {
            walker_.PassValue();
        } else if (walker_.Peek() == '{') {
            // Of members with one name the first is what was read.
            std::set<std::string> seen;
            walker_.ForEachMember([&](const std::string& name) {
                const auto child = node.children.find(name);
                const bool wanted = child != node.children.end() && seen.insert(name).second;
                if (wanted) Assign(child->second, walker_.At());
                walker_.PassName();
                if (wanted)
                    Descend(child->second);
                else
                    walker_.PassValue();
            });
        } else {
            DescendInArray(node);
        }
    }
    void DescendInArray(const PlaceNode& node) {
        std::map<std::size_t, const PlaceNode*> items;
        for (const auto& [token, child] : node.children) {
            std::size_t index = 0;
            const char* const end = token.data() + token.size();
            if (std::from_chars(token.data(), end, index).ptr == end) items.emplace(index, &child);
        }
        auto next = items.begin();
        walker_.ForEachIn([&](std::size_t index) {
            if (next == items.end() || next->first != index) {
                walker_.PassValue();
                return;
            }
            Assign(*next->second, walker_.At());
            Descend(*next->second);
            ++next;
        });
    }

    DocumentWalker walker_;
    std::vector<std::size_t>& offsets_;
};

long long TimeOf(const std::string& path, std::error_code& error) {
    const auto time = std::filesystem::last_write_time(plt_Path(path), error).time_since_epoch();
    return static_cast<long long>(time.count());
}

} // namespace

void mdf_PutPosition(fnd_Finding& finding, std::string_view text, std::size_t offset) {
    const std::string_view before = text.substr(0, offset);
    const std::size_t newline = before.rfind('\n');
    std::size_t lineBegin = newline == std::string_view::npos ? 0 : newline + 1;
    if (lineBegin == 0 && before.starts_with(kMark)) lineBegin = kMark.size();
    finding.line = 1 + static_cast<long>(std::count(before.begin(), before.end(), '\n'));
    finding.column = 1 + static_cast<long>(offset - lineBegin);
}

void mdf_Locate(std::string_view text, std::span<fnd_Finding> findings) {
    PlaceNode root;
    std::vector<std::size_t> wanted;
    for (std::size_t i = 0; i < findings.size(); ++i) {
        if (findings[i].line > 0) continue;
        EnterPlace(root, findings[i].place, i);
        wanted.push_back(i);
    }
    if (wanted.empty()) return;
    std::vector<std::size_t> offsets(findings.size(), 0);
    PlaceFinder(text, offsets).Find(root);
    // Lines are counted once, from one place to the next.
    std::ranges::sort(wanted, {}, [&](std::size_t i) { return offsets[i]; });
    std::size_t counted = 0;
    long lines = 0;
    for (const std::size_t i : wanted) {
        const std::string_view between = text.substr(counted, offsets[i] - counted);
        const auto more = static_cast<long>(std::count(between.begin(), between.end(), '\n'));
        const std::size_t newline = text.substr(0, offsets[i]).rfind('\n');
        const std::size_t lineBegin = newline == std::string_view::npos ? 0 : newline + 1;
        lines += more;
        counted = offsets[i];
        mdf_PutPosition(findings[i], text.substr(lineBegin), offsets[i] - lineBegin);
        findings[i].line += lines;
    }
}

std::vector<std::size_t> mdf_RepeatedMembers(std::string_view text, std::size_t object) {
    std::vector<std::size_t> offsets;
    std::set<std::string> seen;
    DocumentWalker walker(text, object);
    walker.ForEachMember([&](const std::string& name) {
        if (!seen.insert(name).second) offsets.push_back(walker.At());
        walker.PassName();
        walker.PassValue();
    });
    return offsets;
}

mdf_FileText::mdf_FileText(const std::string& path) : path_(path) {
    std::error_code error;
    isFile_ = std::filesystem::is_regular_file(plt_Path(path), error);
    if (!isFile_) return;
    size_ = static_cast<long long>(std::filesystem::file_size(plt_Path(path), error));
    time_ = TimeOf(path, error);
    isFile_ = !error;
}

bool mdf_FileText::IsUnchanged() const {
    std::error_code error;
    return static_cast<long long>(std::filesystem::file_size(plt_Path(path_), error)) == size_ && !error &&
           TimeOf(path_, error) == time_ && !error;
}

void mdf_FileText::Locate(std::span<fnd_Finding> findings) const {
    if (std::ranges::all_of(findings, [](const fnd_Finding& finding) { return finding.line > 0; })) return;
    if (!isFile_) {
        if (!kept_.empty()) mdf_Locate(kept_, findings);
        return;
    }
    std::string text;
    fnd_Finding error;
    if (!IsUnchanged() || !mdf_ReadFile(path_, text, error) || !IsUnchanged()) return;
    mdf_Locate(text, findings);
}
