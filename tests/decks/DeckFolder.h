#ifndef QRX_TESTS_DECKS_DECKFOLDER_H
#define QRX_TESTS_DECKS_DECKFOLDER_H

#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

/// The folder of the golden decks: pairs of `<name>.json`, the model, and `<name>.inp`, its deck.
std::filesystem::path DeckFolder();
/// Names of the files with this extension (".json", ".inp"), sorted.
std::vector<std::string> DeckNames(std::string_view extension);

/// The project's own folder, which the paths of pairs start from.
std::filesystem::path ProjectFolder();
/// Paths, without extension, of all pairs in the folder of the golden decks: "tests/decks/connectors".
std::vector<std::string> GoldenPairs();
/// The same of the examples that have their deck beside them: "examples/assembly/assembly". Sorted.
std::vector<std::string> ExamplePairs();
/// What a test of this pair is called: a golden deck's name, or an example's path; other characters than
/// letters, digits and "_" become "_".
std::string TestNameOfPair(const std::string& path);

/// All bytes of a file; raises std::runtime_error when it can't be read or written.
std::string ReadBytes(const std::filesystem::path& path);
void WriteBytes(const std::filesystem::path& path, std::string_view bytes);

enum class DeckRewriting { no, yes, refused };
/// Whether expected decks are to be rewritten, from the values of QRX_REWRITE_DECKS and CI (null when not
/// set): "1" asks for it, and CI "true" refuses it.
DeckRewriting RewritingOfDecks(const char* rewriteDecks, const char* ci);

#endif
