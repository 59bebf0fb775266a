#ifndef QRX_OIF_OUTPUTREQUESTBUILDER_H
#define QRX_OIF_OUTPUTREQUESTBUILDER_H

#include "base/oif_Component.h"
#include "output/oif_OutputCollector.h"

/// What closes the steps: controls, restart, prints, and the output requests, of which the deck wants groups
/// of equal frequency.
class oif_OutputRequestBuilder final : public oif_ComponentOf<oif_OutputRequestBuilder> {
public:
    explicit oif_OutputRequestBuilder(oif_ModelInfo& modelInfo) : oif_ComponentOf(modelInfo) {}
    void Build() override;

    /// Whether a region can give results of nodes, of elements; the whole model gives both.
    static bool IsWritableNodeRegion(const rgnC_Region& region);
    static bool IsWritableElementRegion(const rgnC_Region& region);

private:
    using Channel = korC_OdbChannel;
    using Request = korC_OdbRequest;

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
    void CreateOdbRequests(const Channel& channel, const oif_OutputPlace& place,
                           const cow_List<cow_String>& names);
    /// Whether all variables are of a kind that the region can't give.
    static bool IsScreenedOut(const Request& request, const Channel& channel, unsigned stepType);
    Traits TraitsOf(const Request& request) const;
    void RequestNoOutput(const Channel& channel, const oif_OutputPlace& place, bool pre);
    void AddOutputDefinition(const Request& request, const Channel& channel, const oif_OutputPlace& place,
                             bool pre, bool all);
    void AddOutputSuboptions(const Request& request, const Channel& channel, const oif_OutputPlace& place,
                             const Traits& traits);
    /// Whether the *Output line says it all, or only rebar is asked for.
    static bool IsSilent(const Request& request, const Traits& traits);
    void AddIntegratedOutput(const Request& request, const oif_OutputPlace& place, const Traits& traits);
    void AddNodeOutput(const Request& request, const oif_OutputPlace& place, const Traits& traits);
    void AddElementOutput(const Request& request, const Channel& channel, const oif_OutputPlace& place,
                          const Traits& traits, const cow_String& secondName, bool force);
    void AddModalOutput(const Request& request, const oif_OutputPlace& place, const Traits& traits);
    void AddEnergyOutput(const Request& request, const oif_OutputPlace& place, const Traits& traits);
    void AddIncrementationOutput(const Request& request, const oif_OutputPlace& place, const Traits& traits);
    void AddContactOutput(const Request& request, const Channel& channel, const oif_OutputPlace& place,
                          const Traits& traits);
    void AddRadiationOutput(const Request& request, const oif_OutputPlace& place, const Traits& traits);

    /// Names of the sets that springs and dashpots have in decks, from the first; empty for none.
    static cow_String GetSpringSetName(const cow_List<cow_String>& springs);
    static cow_String GetDashpotSetName(const cow_List<cow_String>& springs);
    /// The model view has no springs, so none is ever found.
    static const cls_Record* GetSpring(const cow_String& name);
    cow_String GetSurfaceName(const rgnC_Region& region) const;
};

#endif
