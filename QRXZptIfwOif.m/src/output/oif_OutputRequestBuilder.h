#ifndef QRX_OIF_OUTPUTREQUESTBUILDER_H
#define QRX_OIF_OUTPUTREQUESTBUILDER_H

#include "base/oif_Component.h"
#include "store_interface/records/output/korC_OdbRequestTable.h"

/// What closes the steps: controls, restart, prints, and the output requests, of which the model holds named
/// ones that live across steps and the deck wants groups of equal frequency.
class oif_OutputRequestBuilder final : public oif_ComponentOf<oif_OutputRequestBuilder> {
public:
    explicit oif_OutputRequestBuilder(oif_ModelInfo& modelInfo);
    void Build() override;

    /// Whether the step can be written so often.
    static bool IsAllowed(korC_TypeEnm type, const kprC_AnalysisStep& step, bool isField);
    /// Whether a region can give results of nodes, of elements; the whole model gives both.
    static bool IsWritableNodeRegion(const rgnC_Region& region);
    static bool IsWritableElementRegion(const rgnC_Region& region);

private:
    using Channel = korC_OdbChannel;
    using Request = korC_OdbRequest;

    /// The step whose requests are written.
    struct Place {
        const kprC_AnalysisStep& step;
        cow_String stepName;
        unsigned stepType;
        double time; ///< period of an explicit step, else 0
    };
    /// Of a request, what decides about its keywords.
    struct Traits {
        korC_DomainTypeEnm domain = korC_DomainTypeEnm::WHOLE_MODEL;
        bool pre = false;
        bool all = false;
        bool whole = false; ///< the whole model
        cow_String setName;
        bool hasSurface = false;
    };

    void AddSolutionControls(const kprC_AnalysisStep& step, const cow_String& stepName);
    void AddSolverControls(const kprC_AnalysisStep& step, const cow_String& stepName);
    /// `previous` is the print in force so far; it becomes the one that the next step's is compared with.
    void AddDiagnosticPrint(const kprC_AnalysisStep& step, const cow_String& stepName,
                            mdl_ObjCow<kprC_DiagnosticPrint>& previous);
    /// The watched node's set as decks refer to it; empty when nothing is watched.
    cow_String GetMonitorSetName(const kprC_AnalysisStep& step) const;
    /// Whether a request has the step; one about a bolt load or an interaction only if that is there.
    bool HasFieldRequest(const cow_String& stepName) const;
    bool HasHistoryRequest(const cow_String& stepName) const;
    bool RefersToSomething(const korC_Output& output) const;
    bool HasSimBasedStep() const { return hasSimBasedStep_; }

    /// The merged requests of the step; `names` goes with them, entry by entry.
    Channel GetField(const Place& place, cow_List<cow_String>& names) const;
    Channel GetHistory(const Place& place, cow_List<cow_String>& names) const;
    template <class State>
    void Collect(const korC_Output& output, const cow_String& name, const Place& place, Request request,
                 Channel& channel, cow_List<cow_String>& names) const;
    void CollectRemeshingRules(const Place& place, Channel& channel, cow_List<cow_String>& names) const;
    static void Merge(const Request& request, const cow_String& name, Channel& channel,
                      cow_List<cow_String>& names);

    void CreateOdbRequests(const Channel& channel, const Place& place, const cow_List<cow_String>& names);
    /// Whether all variables are of a kind that the region can't give.
    static bool IsScreenedOut(const Request& request, const Channel& channel, unsigned stepType);
    Traits TraitsOf(const Request& request) const;
    void RequestNoOutput(const Channel& channel, const Place& place, bool pre);
    void AddOutputDefinition(const Request& request, const Channel& channel, const Place& place, bool pre,
                             bool all);
    void AddOutputSuboptions(const Request& request, const Channel& channel, const Place& place,
                             const Traits& traits);
    /// Whether the *Output line says it all, or only rebar is asked for.
    static bool IsSilent(const Request& request, const Traits& traits);
    void AddIntegratedOutput(const Request& request, const Place& place, const Traits& traits);
    void AddNodeOutput(const Request& request, const Place& place, const Traits& traits);
    void AddElementOutput(const Request& request, const Channel& channel, const Place& place,
                          const Traits& traits, const cow_String& secondName, bool force);
    void AddModalOutput(const Request& request, const Place& place, const Traits& traits);
    void AddEnergyOutput(const Request& request, const Place& place, const Traits& traits);
    void AddIncrementationOutput(const Request& request, const Place& place, const Traits& traits);
    void AddContactOutput(const Request& request, const Channel& channel, const Place& place,
                          const Traits& traits);
    void AddRadiationOutput(const Request& request, const Place& place, const Traits& traits);

    /// Names of the sets that springs and dashpots have in decks, from the first; empty for none.
    static cow_String GetSpringSetName(const cow_List<cow_String>& springs);
    static cow_String GetDashpotSetName(const cow_List<cow_String>& springs);
    static cow_String GetInteractionSetName(const cow_List<cow_String>& interactions);
    /// The model view has no springs, so none is ever found.
    static const cls_Record* GetSpring(const cow_String& name);
    cow_String GetSurfaceName(const rgnC_Region& region) const;

    cow_List<cow_String> remeshingSteps_;
    bool hasSimBasedStep_ = false;
};

#endif
