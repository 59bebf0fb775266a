#ifndef QRX_DCK_CHECK_H
#define QRX_DCK_CHECK_H

#include "foundation/cow_String.h"
#include "store_interface/findings/fnd_Finding.h"

#include <memory>

class dck_Kept;
class odb_Odb;
class odiK_Mesh;
struct mq_Quality;
struct thr_Progress;

/// Everything that can be said of a store's model before its deck is written, whether
/// the store was filled in memory or from a file: errors that a model file would be refused for, and warnings
/// of what the deck can't say, what writing raises, what no step writes. Places are JSON pointers into the
/// model file that the store would make. What the model says is to be ignored is left out. Raises when the
/// model can't be completed or isn't there.
std::vector<fnd_Finding> dck_Check(const odb_Odb& store);

/// The part that a reader of a model file has said already: names, references, fields that a record can't do
/// without, and the rules of single records and of the model.
void dck_CheckStore(const odb_Odb& store, const cow_String& modelName, fnd_Sink& sink);
/// The part that only the deck writer's rules tell. To be asked of a model without errors.
void dck_CheckDeck(const odb_Odb& store, const cow_String& modelName, fnd_Sink& sink);
/// The same, where something is kept of a model that this one shares with (odiK_Model::Share): only those
/// checks are made that read something in which they differ.
void dck_CheckDeck(const odb_Odb& store, const cow_String& modelName, const dck_Kept& kept, fnd_Sink& sink);
/// What is to be kept of a model for that. Raises what checking raises.
std::unique_ptr<const dck_Kept> dck_KeepChecks(const odb_Odb& store, const cow_String& modelName);
/// Writes the deck to nowhere: says what is raised, unless it stands among the `told`
/// ones, and how large a huge deck will be.
/// `progress`: counts the deck's bytes meanwhile.
void dck_Rehearse(const odb_Odb& store, const std::vector<fnd_Finding>& told, fnd_Sink& sink,
                  thr_Progress* progress = nullptr);
/// The quality of all meshes: elements of negative or zero size, mid-side nodes far away, nodes and elements
/// that stand twice, nodes of no element, faces that three solids share.
void dck_CheckMeshes(const odb_Odb& store, const cow_String& modelName, fnd_Sink& sink);
/// The quality of one mesh, and what there is to say of it at a place.
mq_Quality dck_QualityOf(const odiK_Mesh& mesh);
void dck_CheckMesh(const odiK_Mesh& mesh, const std::string& place, fnd_Sink& sink);
void dck_TellQuality(const mq_Quality& quality, const std::string& place, fnd_Sink& sink);

#endif
