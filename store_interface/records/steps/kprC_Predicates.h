#ifndef QRX_STORE_KPRC_PREDICATES_H
#define QRX_STORE_KPRC_PREDICATES_H

class kprC_AnalysisStep;

// What holds for a procedure as such. Its number is the class number of its step record; 0 and every other
// number that is no procedure's give false throughout.

/// Annealing and the two explicit dynamics procedures.
bool kprC_IsExplicit(unsigned stepType);
/// The linear procedures, which leave the state of the model as it was.
bool kprC_IsPerturbation(unsigned stepType);
/// Heat transfer, mass diffusion, coupled thermal-electric.
bool kprC_IsNonmechanical(unsigned stepType);
bool kprC_LoadCasesAreAllowed(unsigned stepType);
bool kprC_AdaptiveMeshDomainsAreAllowed(unsigned stepType);
/// Implicit, modal and subspace dynamics, whose output comes every tenth increment unless asked otherwise.
bool kprC_IsImplicitModal(unsigned stepType);
/// The eigenvalue procedures: buckling, frequency, complex frequency.
bool kprC_IsFrequencyBuckle(unsigned stepType);
/// The procedures whose end modal dynamics can go on from.
bool kprC_CanBeContinued(unsigned stepType);

// The forms in which output can be asked for; `isField` tells field from history output.

/// By a list of modes.
bool kprC_ModesIsAllowed(unsigned stepType);
/// Every n-th increment.
bool kprC_OutputFrequencyIsAllowed(unsigned stepType, bool isField);
/// In so many equal intervals.
bool kprC_NumberIntervalIsAllowed(const kprC_AnalysisStep& step);
/// In intervals of a given time.
bool kprC_TimeIntervalIsAllowed(unsigned stepType);
/// At given points in time.
bool kprC_TimePointIsAllowed(unsigned stepType, bool isField);
/// Exactly at the marks of the intervals.
bool kprC_TimeMarksIsAllowed(unsigned stepType, bool isField);

#endif
