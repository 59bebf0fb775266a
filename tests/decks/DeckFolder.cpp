#include "decks/DeckFolder.h"

#include <algorithm>
#include <fstream>
#include <iterator>
#include <stdexcept>

namespace {

constexpr std::string_view kGoldenPrefix = "tests/decks/";

bool IsNameCharacter(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '_';
}

} // namespace

std::filesystem::path ProjectFolder() {
    return QRX_PROJECT_FOLDER;
}

std::filesystem::path DeckFolder() {
    return ProjectFolder() / kGoldenPrefix;
}

std::vector<std::string> DeckNames(std::string_view extension) {
    std::vector<std::string> names;
    for (const auto& entry : std::filesystem::directory_iterator(DeckFolder())) {
        if (entry.path().extension() == extension) names.push_back(entry.path().stem().string());
    }
    std::sort(names.begin(), names.end());
    return names;
}

std::vector<std::string> GoldenPairs() {
    std::vector<std::string> paths = DeckNames(".json");
    for (std::string& path : paths) path.insert(0, kGoldenPrefix);
    return paths;
}

std::vector<std::string> ExamplePairs() {
    std::vector<std::string> paths;
    for (const auto& folder : std::filesystem::directory_iterator(ProjectFolder() / "examples")) {
        if (!folder.is_directory()) continue;
        for (const auto& entry : std::filesystem::directory_iterator(folder)) {
            std::filesystem::path file = entry.path();
            if (file.extension() != ".json") continue;
            if (!std::filesystem::exists(file.replace_extension(".inp"))) continue;
            paths.push_back("examples/" + folder.path().filename().string() + "/" + file.stem().string());
        }
    }
    std::sort(paths.begin(), paths.end());
    return paths;
}

std::string TestNameOfPair(const std::string& path) {
    std::string name = path.starts_with(kGoldenPrefix) ? path.substr(kGoldenPrefix.size()) : path;
    for (char& c : name) {
        if (!IsNameCharacter(c)) c = '_';
    }
    return name;
}

std::string ReadBytes(const std::filesystem::path& path) {
    std::ifstream in(path, std::ios::binary);
    std::string bytes{std::istreambuf_iterator<char>(in), {}};
    if (!in.is_open() || in.bad()) throw std::runtime_error("can't read " + path.string());
    return bytes;
}

void WriteBytes(const std::filesystem::path& path, std::string_view bytes) {
    std::ofstream out(path, std::ios::binary);
    out.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    out.close();
    if (!out) throw std::runtime_error("can't write " + path.string());
}

DeckRewriting RewritingOfDecks(const char* rewriteDecks, const char* ci) {
    if (rewriteDecks == nullptr || std::string_view(rewriteDecks) != "1") return DeckRewriting::no;
    return ci != nullptr && std::string_view(ci) == "true" ? DeckRewriting::refused : DeckRewriting::yes;
}
