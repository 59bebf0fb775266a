#ifndef QRX_DECK_READER_DRD_PARSER_H
#define QRX_DECK_READER_DRD_PARSER_H

#include "deck_reader/drd_LineSource.h"
#include "deck_reader/drd_Reader.h"
#include "deck_reader/drd_TextMap.h"

#include <filesystem>
#include <memory>

/// Reads one deck: takes line by line from the files on the stack of includes and fills the deck.
class drd_Parser {
public:
    drd_Parser(const drd_ReadOptions& options, drd_Findings& findings)
        : options_(options), findings_(findings) {}

    void OpenMain(const std::string& path);
    void OpenText(std::string_view text, const std::string& name);
    drd_Deck Run();

private:
    struct Source {
        drd_LineSource lines;
        int file;
        std::filesystem::path path;
        std::string_view pending = {}; ///< a line that was read ahead
        bool hasPending = false;
    };

    // Lines (drd_Parser.cpp).
    bool NextLine(std::string_view& line);
    void PutBack(std::string_view line);
    /// The next line of a data block, comments passed by; false, with the line put back, at a keyword.
    bool NextDataLine(std::string_view& line);
    void LookAtLine(std::string_view line);
    void CloseSource();
    drd_Place Here() const { return {current_->file, current_->lines.Line()}; }
    drd_Line Keep(std::string_view text, drd_Place place);
    void Comment(std::string_view line);

    // Keywords (drd_ParserKeywords.cpp).
    void Keyword(std::string_view line);
    /// The keyword line, kept, with its continuations: in one line, and as `asItStands`.
    std::string_view Header(std::string_view line, std::string_view& asItStands);
    bool ParseHeader(std::string_view header, drd_Keyword& keyword);
    /// What is known of a word that is kept; each spelling is looked up once.
    const drd_Spelling* SpellingOf(drd_Word word);
    /// A name without its quotes, of a value that is kept.
    drd_Word NameOf(std::string_view value);
    bool Include(const drd_Keyword& keyword);
    void OpenFile(const std::filesystem::path& path, drd_Place includedAt);
    void AddKeyword(drd_Keyword& keyword);
    /// Begins to read its data.
    void BeginData(drd_DataEnm data);
    void PlaceInBlock(drd_Keyword& keyword);
    void OpenBlock(drd_BlockEnm kind, const drd_Keyword& keyword);
    void CloseBlock(drd_BlockEnm kind, const drd_Keyword& keyword);
    void LeaveBlock();
    void FindOwner(drd_Keyword& keyword);
    drd_Keyword& Last() { return deck_.keywords.back(); }

    // Data (drd_ParserData.cpp).
    void Data(std::string_view line);
    void BeginNodes();
    void BeginElements();
    void BeginSet(drd_KindEnm kind);
    void AddOwnSet(drd_KindEnm kind, std::string_view parameter);
    void Nodes(std::string_view line);
    void NodeLine(drd_Mesh& mesh, std::string_view line);
    void Elements(std::string_view line);
    bool ElementRecord(drd_Mesh& mesh, std::string_view line);
    bool ElementNodes(drd_Mesh& mesh, const char* at);
    bool NodeOfInstance(drd_Mesh& mesh, const char*& at);
    void SetLines(std::string_view line);
    void SetLine(std::string_view line);
    void GeneratedLine(std::string_view line);
    drd_Mesh& CurrentMesh();
    void AddPlace(std::vector<drd_PlaceRun>& runs, std::uint64_t record, drd_Place place);
    void WrongNumber(std::string_view line, const char* expected);
    void Finish();

    drd_ReadOptions options_;
    drd_Findings& findings_;
    drd_Deck deck_;
    std::vector<std::unique_ptr<Source>> sources_;
    Source* current_ = nullptr;
    std::size_t includes_ = 0;

    std::vector<int> blockStack_ = {0};
    int owner_ = -1; // the keyword whose options follow
    void (drd_Parser::*bulk_)(std::string_view) = nullptr;
    int type_ = -1; // of the elements that are being read
    int nodesOfType_ = 0;
    drd_TextMap typeIndex_;
    drd_TextMap ownerIndex_;
    drd_TextMap spellingIndex_;
    std::vector<const drd_Spelling*> spellings_;
    std::vector<std::string_view> fields_;
    std::vector<drd_Parameter> parameters_; // of the keyword that is being read
    std::vector<drd_Word> members_;         // of the set that is being read
    bool toldDataBeforeKeyword_ = false;
};

#endif
