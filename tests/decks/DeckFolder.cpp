#include "decks/DeckFolder.h"

#include <algorithm>
#include <fstream>
#include <iterator>
#include <stdexcept>

std::filesystem::path DeckFolder() {
    return QRX_DECK_FOLDER;
}

std::vector<std::string> DeckNames(std::string_view extension) {
    std::vector<std::string> names;
    for (const auto& entry : std::filesystem::directory_iterator(DeckFolder())) {
        if (entry.path().extension() == extension) names.push_back(entry.path().stem().string());
    }
    std::sort(names.begin(), names.end());
    return names;
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
