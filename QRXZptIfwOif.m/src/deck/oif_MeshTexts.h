#ifndef QRX_OIF_MESHTEXTS_H
#define QRX_OIF_MESHTEXTS_H

#include "foundation/cow_CountedHld.h"
#include "foundation/qio_Device.h"

#include <memory>
#include <string>

class odiK_Mesh;

/// What of a mesh is one text in every deck that shows it.
enum class oif_MeshBlockEnm { NODES, ELEMENTS, SETS };
inline constexpr int oif_kMeshBlocks = 3;

/// A device of somebody who writes many decks with the same meshes: it keeps the texts of their nodes and
/// elements, which no other part of a model has a say in, and gets them handed back instead of their bytes.
class oif_MeshTexts : public qio_ostream {
public:
    using Text = std::shared_ptr<const std::string>;

    /// The text that was kept for the mesh, or null.
    virtual Text Find(const odiK_Mesh& mesh, oif_MeshBlockEnm block) = 0;
    /// A text that has just been made for the mesh; whoever keeps it holds the mesh too. Gives the one to be
    /// used, which somebody else may have made meanwhile.
    virtual Text Keep(const cow_CountedHld<odiK_Mesh>& mesh, oif_MeshBlockEnm block, const Text& text) = 0;
    /// As Write().
    virtual void WriteKept(const Text& text) = 0;
};

#endif
