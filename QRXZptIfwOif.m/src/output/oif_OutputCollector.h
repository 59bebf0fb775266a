#ifndef QRX_OIF_OUTPUTCOLLECTOR_H
#define QRX_OIF_OUTPUTCOLLECTOR_H

#include "base/oif_ModelInfo.h"
#include "store_interface/records/output/korC_OdbRequestTable.h"

/// The step whose requests are written.
struct oif_OutputPlace {
    const kprC_AnalysisStep& step;
    cow_String stepName;
    unsigned stepType;
    double time; ///< period of an explicit step, else 0
};

/// The interaction that a request is about: the first of its list; empty for none.
cow_String oif_FirstInteraction(const cow_List<cow_String>& interactions);

/// The output requests of a step. The model holds named ones that live across steps; equal ones become one,
/// and what the procedure doesn't allow is replaced by what it usually gets.
class oif_OutputCollector {
public:
    /// The model must outlive it.
    explicit oif_OutputCollector(const oif_Model& model);

    /// Whether the step can be written so often.
    static bool IsAllowed(korC_TypeEnm type, const kprC_AnalysisStep& step, bool isField);

    /// To be told of each step when its turn comes: earlier steps don't know of one that is simulation based.
    void Enter(const kprC_AnalysisStep& step) {
        if (!step.suppressed && step.SimBased()) hasSimBasedStep_ = true;
    }
    /// Whether a request has the step; one about a bolt load or an interaction only if that is there.
    bool HasField(const cow_String& stepName) const;
    bool HasHistory(const cow_String& stepName) const;
    /// The merged requests of the step; `names` goes with them, entry by entry.
    korC_OdbChannel GetField(const oif_OutputPlace& place, cow_List<cow_String>& names) const;
    korC_OdbChannel GetHistory(const oif_OutputPlace& place, cow_List<cow_String>& names) const;

private:
    using Channel = korC_OdbChannel;
    using Request = korC_OdbRequest;

    bool RefersToSomething(const korC_Output& output) const;
    template <class State>
    void Collect(const korC_Output& output, const cow_String& name, const oif_OutputPlace& place,
                 Request request, Channel& channel, cow_List<cow_String>& names) const;
    void CollectRemeshingRules(const oif_OutputPlace& place, Channel& channel,
                               cow_List<cow_String>& names) const;
    static void Merge(const Request& request, const cow_String& name, Channel& channel,
                      cow_List<cow_String>& names);

    const oif_Model& model_;
    cow_List<cow_String> remeshingSteps_;
    bool hasSimBasedStep_ = false;
};

#endif
