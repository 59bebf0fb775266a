#ifndef QRX_DCK_DECKCOUNTS_H
#define QRX_DCK_DECKCOUNTS_H

#include "store_interface/model/odiK_Model.h"

#include <set>
#include <string>
#include <vector>

/// How many objects of a kind a model has for its deck.
struct dck_KindCount {
    const char* key;  ///< for JSON
    const char* name; ///< for people
    long long count;
};

/// The counts of what goes into the deck, kinds without an object left out. Nodes, elements and sets count
/// once in every instance that shows them; suppressed objects don't count.
std::vector<dck_KindCount> dck_CountsOfDeck(const odiK_Model& model);

/// The contents of meshes, once for every instance that shows them, and of the assembly's sets.
struct dck_MeshCounts {
    long long nodes = 0;
    long long elements = 0;
    long long surfaceElements = 0; ///< not among the elements
    long long nodeSets = 0;
    long long elementSets = 0;
    long long surfaces = 0;

    static dck_MeshCounts Of(const odiK_Model& model);

private:
    void AddMesh(const odiK_Mesh& mesh);
    void AddSets(const std::vector<cow_CountedHld<odiK_Set>>& sets);
};

/// The parts that instances show.
std::set<cow_String> UsedParts(const odiK_Model& model);
bool IsSuppressed(const cls_Record& record);

#endif
