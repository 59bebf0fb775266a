#ifndef QRX_DCK_CHECKS_H
#define QRX_DCK_CHECKS_H

#include "foundation/cow_String.h"
#include "store_interface/findings/fnd_Finding.h"

class dck_Subject;
class odiK_Model;
class oif_ModelInfo;

/// An option of a material that its deck can't carry.
struct dck_IdleOption {
    cow_String material;
    std::string_view option;
    /// True: an ordinary option of a gasket material; false: a gasket option of an ordinary one.
    bool ofGasket;
};
/// Which options gaskets, or materials that are none, leave out, by the sections that name the materials.
std::vector<dck_IdleOption> dck_IdleGasketOptions(const odiK_Model& model);

// What can be foreseen of a complete model, family by family: what its deck can't say, what raises, what no
// step writes. Places are below the model. A check that takes a subject keeps what takes long to work out.

/// Element types that don't exist, node counts and faces that don't fit a type, names of sets with a dot.
void dck_CheckElements(const odiK_Model& model, fnd_Sink& sink);
/// Elements without a section or with one that they can't take, idle materials, options that gaskets or
/// materials that are none leave out.
void dck_CheckSections(const odiK_Model& model, fnd_Sink& sink);
/// Boundary conditions.
void dck_CheckConditions(const odiK_Model& model, fnd_Sink& sink);
/// Loads and predefined fields.
void dck_CheckLoads(const oif_ModelInfo& info, fnd_Sink& sink);
void dck_CheckInteractions(const odiK_Model& model, fnd_Sink& sink);
void dck_CheckConstraints(const odiK_Model& model, fnd_Sink& sink);
/// Output requests: variables that a procedure or a region can't give, frequencies that a procedure doesn't
/// allow and what is written instead, objects that aren't there. Suppressed requests are passed over; what
/// holds in several steps is said of the first.
void dck_CheckRequests(const odiK_Model& model, fnd_Sink& sink);

/// What procedures need of materials and elements; steps of both solvers in one job.
void dck_CheckProcedures(const odiK_Model& model, fnd_Sink& sink);
/// Conditions and loads that contradict each other: several values of one degree of freedom, loads on held
/// ones.
void dck_CheckMeetings(const dck_Subject& subject, fnd_Sink& sink);
/// Ties whose sides have nodes in common.
void dck_CheckTies(const odiK_Model& model, fnd_Sink& sink);
/// Contact pairs whose two sides are one.
void dck_CheckContactPairs(const odiK_Model& model, fnd_Sink& sink);
/// States that say nothing: in steps out of reach, without components, with intervals that don't count, with
/// amplitudes that end too early.
void dck_CheckStates(const dck_Subject& subject, fnd_Sink& sink);
/// What the model holds and no line of the deck carries: fields that decks don't know, nodes of the assembly,
/// objects that nothing refers to.
void dck_CheckLoss(const dck_Subject& subject, fnd_Sink& sink);

#endif
