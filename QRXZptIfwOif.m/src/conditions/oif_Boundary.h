#ifndef QRX_OIF_BOUNDARY_H
#define QRX_OIF_BOUNDARY_H

#include "base/oif_KeywordLine.h"
#include "conditions/oif_BCTable.h"
#include "store_interface/records/conditions/kbcC_ScalarBCs.h"
#include "store_interface/records/conditions/kbcC_SupportBCs.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"

/// A boundary condition in one step: its card, with a data line for each component that is to be said. A
/// keyword that adds and changes says only what was set in the step; one with op=NEW, or with a new
/// amplitude, says what is carried over too. A condition that ends in the step is its card alone. What the
/// others write is told by the row of their class; a class without one, or of the other keyword, raises.
class oif_ConditionKeyword : public qkw_Keyword {
public:
    void Write(utl_Stream& stream) const override;
    const kbcC_BC& Condition() const { return card_.Object(); }

    void WriteDisplacements(utl_Stream& stream, bool fixed) const;
    /// Velocities and accelerations, which are told by the type; held ones go without their values.
    void WriteRates(utl_Stream& stream, const char* type, bool held) const;

protected:
    /// What the two keywords differ in.
    struct Style {
        const char* keyword;
        oif_BCFamily family;
        /// The degree of freedom stands twice, as the first and the last of a range.
        bool dofRange;
        /// An amplitude that was taken away counts as a new one.
        bool clearedAmplitudeIsNew;
        /// What is raised for a class that the keyword isn't made of.
        const char* failure;
    };
    oif_ConditionKeyword(const Style& style, const oif_BCCard& card, const cow_String& initialStepName);

    virtual void WriteBaseName(oif_KeywordLine&) const {}

    /// The type stands behind all other parameters; null for none.
    void WriteBoundaryCard(utl_Stream& stream, kbcC_BC::DistribTypeEnum distributionType, bool fixed,
                           int loadCase, const char* type = nullptr) const;
    void WriteLine(utl_Stream& stream, const cow_String& dofs, double value) const;
    /// The degree of freedom as data lines have it, with its comma.
    cow_String Dof(int number) const;
    /// Writes with the number of each load case of a buckling step that the condition enters, in another
    /// step with 0.
    template <class Block>
    void ForEachLoadCase(const Block& block) const;

    /// Whether what came to hold its value in this way is to be said.
    bool IsSaid(mdl_PropAttributeStateEnm state) const;
    template <class S>
    const S& State() const {
        return static_cast<const S&>(card_.Quad().state.ConstGet());
    }
    /// 0 for the initial step.
    unsigned Procedure() const;
    bool IsBuckling() const;
    bool UsesComplex() const { return card_.Quad().state.ConstGet().UseComplex(Procedure()); }

    const Style* style_; // of the class
    oif_BCCard card_;
    cow_String amplitude_;
    bool deactivated_ = false;
    bool modifiedOnly_;
    cow_String initialStepName_;

private:
    void WriteComponents(utl_Stream& stream, bool held, bool imaginary) const;
};

/// Every kind of boundary condition but those of connectors:
///     *Boundary, op=NEW, amplitude=A, load case=1, fixed, user, base name=NAME
///     SET, 1, 1, 0.5
class oif_Boundary final : public qkw_KeywordOf<oif_Boundary, oif_ConditionKeyword> {
public:
    oif_Boundary(const oif_BCCard& card, bool shellToSolid, const cow_String& initialStepName);

    /// A boundary that a global model drives in this step: its data lines stand under a line that it shares
    /// with others, oif_BoundarySubmodelList's.
    bool IsBCSubmodel() const { return isBCSubmodel_; }
    /// The keyword line of a submodel boundary.
    const cow_String& BCSubmodelKwd() const { return submodelKeyword_; }
    /// The name without a leading "__basename__".
    static cow_String FixBCNameHack(const cow_String& name);

    void WriteType(utl_Stream& stream) const;
    void WriteTemperature(utl_Stream& stream, const kbcC_TemperatureBC& bc) const;
    void WriteDistributed(utl_Stream& stream, const kbcC_DistributedBC& bc, int dof) const;
    void WriteComplexDistributed(utl_Stream& stream, const kbcC_DistributedBC& bc, int dof) const;
    void WriteSubmodel(utl_Stream& stream, const kbcC_SubmodelBC& bc) const;

private:
    static constexpr Style kStyle{"*Boundary", oif_BCFamily::BOUNDARY, true, true,
                                  "Unimplemented boundary condition in input file."};

    void CheckForSubmodelBC();
    void WriteBaseName(oif_KeywordLine& line) const override;

    bool isBCSubmodel_ = false;
    cow_String submodelKeyword_;
    bool shellToSolid_;
};

/// A prescribed motion of connectors:
///     *Connector Motion, amplitude=A, type=VELOCITY
///     SET, 1, 0.5
class oif_ConnectorMotion final : public qkw_KeywordOf<oif_ConnectorMotion, oif_ConditionKeyword> {
public:
    oif_ConnectorMotion(const oif_BCCard& card, const cow_String& initialStepName);

private:
    static constexpr Style kStyle{"*Connector Motion", oif_BCFamily::CONNECTOR_MOTION, false, false,
                                  "Unimplemented ConnectorMotion condition in input file."};
};

/// A bolt that is tightened by its length, or held:
///     *Boundary, fixed
///     SET, 1, 1, 0.02
/// or, of a bolt that is tightened by a force or let go, the bare keyword with op=NEW. No builder makes it.
class oif_BoundaryForBoltLoad final : public qkw_KeywordOf<oif_BoundaryForBoltLoad> {
public:
    oif_BoundaryForBoltLoad(const oif_LoadCard& card, const kloC_BoltLoad& boltLoad);
    void Write(utl_Stream& stream) const override;

private:
    void WriteBCCard(utl_Stream& stream, bool fixed) const;
    void WriteBCData(utl_Stream& stream, double value) const;

    mdl_ObjCow<kloC_BoltLoad> boltLoad_;
    cow_String stepName_;
    cow_String setName_;
    oif_Op op_;
    bool clear_;
    double scale_;
};

#endif
