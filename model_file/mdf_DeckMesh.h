#ifndef QRX_MODEL_FILE_MDF_DECKMESH_H
#define QRX_MODEL_FILE_MDF_DECKMESH_H

#include "deck_reader/drd_Names.h"
#include "model_file/mdf_MeshFile.h"

/// Takes the mesh of a model from a deck: nodes, elements of their own types, sets and surfaces of a part, of
/// an instance, or of a flat deck.
class mdf_DeckMesh {
public:
    mdf_DeckMesh(const mdf_MeshFileRequest& request, mdf_MeshOrigin& origin, fnd_Sink& problems)
        : request_(request), origin_(origin), problems_(problems) {}

    /// Whether the file is a deck, by its ending or its first character.
    static bool IsDeck(const std::string& path);
    /// False when an error hinders it.
    bool Fill(odiK_Mesh& mesh);
    /// The same of one block of a deck that has been read.
    bool FillFrom(const drd_Deck& deck, const drd_Names& names, int block, odiK_Mesh& mesh);

private:
    bool ReadDeck();
    bool ChooseBlock();
    bool FillMesh(odiK_Mesh& mesh);
    bool CheckRequest();
    void AddNodes(odiK_Mesh& mesh);
    bool AddElements(odiK_Mesh& mesh);
    void AddSets(odiK_Mesh& mesh);
    void AddSurfaces(odiK_Mesh& mesh);
    void AddSurface(odiK_Mesh& mesh, const drd_Keyword& keyword);
    bool NameOf(const std::string& group, drd_KindEnm kind, std::string& name);
    bool IsSideOfSurface(const drd_Set& set) const;
    void Remember(const std::string& name, const char* kind, std::size_t members);
    void Note(std::string text);
    bool Fail(std::string found, std::string expected, std::string hint = {});

    const mdf_MeshFileRequest& request_;
    mdf_MeshOrigin& origin_;
    fnd_Sink& problems_;
    drd_Deck ownDeck_;
    std::unique_ptr<drd_Names> ownNames_;
    const drd_Deck* deck_ = nullptr;
    const drd_Names* names_ = nullptr;
    int block_ = -1;
    const drd_Mesh* source_ = nullptr;
};

#endif
