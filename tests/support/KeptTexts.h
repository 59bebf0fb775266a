#ifndef QRX_TESTS_SUPPORT_KEPTTEXTS_H
#define QRX_TESTS_SUPPORT_KEPTTEXTS_H

#include "deck/oif_MeshTexts.h"

#include <map>
#include <string>
#include <utility>

/// A deck as a string, with the texts of meshes kept.
class KeptTexts final : public oif_MeshTexts {
public:
    void Write(const char* text, std::size_t bytes) override { deck.append(text, bytes); }
    Text Find(const odiK_Mesh& mesh, oif_MeshBlockEnm block) override {
        ++asked;
        return texts[{&mesh, block}];
    }
    Text Keep(const cow_CountedHld<odiK_Mesh>& mesh, oif_MeshBlockEnm block, const Text& text) override {
        ++kept;
        return texts[{mesh.Referent(), block}] = text;
    }
    void WriteKept(const Text& text) override { deck += *text; }

    std::string deck;
    std::map<std::pair<const odiK_Mesh*, oif_MeshBlockEnm>, Text> texts;
    int asked = 0;
    int kept = 0;
};

#endif
