#ifndef QRX_OIF_CONSTRAINTS_H
#define QRX_OIF_CONSTRAINTS_H

#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"

/// Two surfaces tied together:
///     *Tie, name=NAME, adjust=yes|no[, position tolerance=T][, no rotation][, constraint ratio=R]
///         [, cyclic symmetry][, type=NODE TO SURFACE|SURFACE TO SURFACE][, no thickness]
///     SLAVE, MASTER
class oif_Tie final : public qkw_KeywordOf<oif_Tie> {
public:
    oif_Tie(const cow_String& name, const kcoC_Tie& tie, const qkw_ModelInfo& modelInfo, bool cyclic);
    /// From names of surfaces. There is only a tolerance, and only above 0:
    ///     *Tie, name=NAME[, position tolerance=T]
    oif_Tie(const cow_String& name, const cow_String& master, const cow_String& slave, double tolerance,
            const qkw_ModelInfo&)
        : name_(name), master_(master), slave_(slave), tolerance_(tolerance) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    cow_String master_;
    cow_String slave_;
    mdl_ObjCow<kcoC_Tie> record_;
    double tolerance_ = 0.0;
    bool cyclic_ = false;
};

/// The surface that follows a node; oif_Kinematic or oif_Distributing tells how:
///     *Coupling, constraint name=NAME, ref node=NODE, surface=SURFACE[, influence radius=R]
///         [, orientation=ORIENTATION]
class oif_Coupling final : public qkw_KeywordOf<oif_Coupling> {
public:
    oif_Coupling(const cow_String& name, const kcoC_Coupling& coupling, const qkw_ModelInfo& modelInfo);
    /// From names. Only "*Coupling, constraint name=NAME" is written, and its line stays open.
    oif_Coupling(const cow_String& name, const cow_String& refNode, const cow_String& surface,
                 double influenceRadius, const qkw_ModelInfo&)
        : name_(name), refNode_(refNode), surface_(surface), influenceRadius_(influenceRadius),
          hasRecord_(false) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    cow_String refNode_;
    cow_String surface_;
    double influenceRadius_;
    cow_String orientation_;
    bool hasRecord_ = true;
};

/// The degrees of freedom that a kinematic coupling ties; all of them when none is listed:
///     *Kinematic
///     1, 1
class oif_Kinematic final : public qkw_KeywordOf<oif_Kinematic> {
public:
    explicit oif_Kinematic(const kcoC_Coupling& coupling) : coupling_(coupling) {}
    void Write(utl_Stream& stream) const override;

private:
    kcoC_Coupling coupling_;
};

/// As oif_Kinematic, for a coupling that spreads the load of its node:
///     *Distributing, weighting method=UNIFORM|LINEAR|QUADRATIC|CUBIC
class oif_Distributing final : public qkw_KeywordOf<oif_Distributing> {
public:
    explicit oif_Distributing(const kcoC_Coupling& coupling) : coupling_(coupling) {}
    void Write(utl_Stream& stream) const override;

private:
    kcoC_Coupling coupling_;
};

/// Elements, nodes or an analytical surface that move as one:
///     *Rigid Body, ref node=NODE[, elset=E][, pin nset=P][, tie nset=T][, analytical surface=S]
///         [, position=CENTER OF MASS][, isothermal=YES]
/// All names as decks refer to them; an empty one leaves its parameter out.
class oif_RigidBody final : public qkw_KeywordOf<oif_RigidBody> {
public:
    oif_RigidBody(const cow_String& refNode, const cow_String& elset, const cow_String& pinNset,
                  const cow_String& tieNset, const cow_String& analyticalSurface, bool centerOfMass,
                  bool isothermal)
        : refNode_(refNode), elset_(elset), pinNset_(pinNset), tieNset_(tieNset),
          analyticalSurface_(analyticalSurface), centerOfMass_(centerOfMass), isothermal_(isothermal) {}
    oif_RigidBody(const cow_String& refNode, const cow_String& elset, const cow_String& analyticalSurface,
                  bool isothermal)
        : oif_RigidBody(refNode, elset, {}, {}, analyticalSurface, false, isothermal) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String refNode_;
    cow_String elset_;
    cow_String pinNset_;
    cow_String tieNset_;
    cow_String analyticalSurface_;
    bool centerOfMass_;
    bool isothermal_;
};

/// Elements embedded in others:
///     *Embedded Element, host elset=HOST[, absolute exterior tolerance=A][, exterior tolerance=F]
///         [, roundoff tolerance=W]
///     EMBEDDED
class oif_EmbeddedRegion final : public qkw_KeywordOf<oif_EmbeddedRegion> {
public:
    oif_EmbeddedRegion(const cow_String& name, const kcoC_EmbeddedRegion& region,
                       const qkw_ModelInfo& modelInfo);
    /// From names of element sets. The tolerances are a fraction of the element size, a length, and a weight.
    oif_EmbeddedRegion(const cow_String& name, const cow_String& host, const cow_String& embedded,
                       double fractionalTolerance, double absoluteTolerance, double weightFactorTolerance,
                       const qkw_ModelInfo&)
        : name_(name), host_(host), embedded_(embedded), fractionalTolerance_(fractionalTolerance),
          absoluteTolerance_(absoluteTolerance), weightFactorTolerance_(weightFactorTolerance) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    cow_String host_;
    cow_String embedded_;
    double fractionalTolerance_;
    double absoluteTolerance_;
    double weightFactorTolerance_;
};

/// A linear equation:
///     *Equation
///     NUMBER OF TERMS
///     SET, DOF, COEFFICIENT
class oif_Equation final : public qkw_KeywordOf<oif_Equation> {
public:
    /// Raises if the constraint is no kcoC_Equation.
    oif_Equation(const cow_String& name, const kcoC_Constraint& constraint);
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    cow_List<kcoC_EquationTerm> terms_;
};

/// A shell's edge joined to a solid's face:
///     *Shell to Solid Coupling, constraint name=NAME[, position tolerance=T][, influence distance=D]
///     EDGE, FACE
class oif_ShellSolidCoupling final : public qkw_KeywordOf<oif_ShellSolidCoupling> {
public:
    oif_ShellSolidCoupling(const cow_String& name, const kcoC_ShellSolidCoupling& coupling,
                           const qkw_ModelInfo& modelInfo);
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    cow_String shellEdge_;
    cow_String solidFace_;
    kcoC_ShellSolidCoupling record_;
};

/// The sector of a cyclic model:
///     *Cyclic Symmetry Model, n=SECTORS
///     X1, Y1, Z1, X2, Y2, Z2
class oif_CyclicSymmetryModel final : public qkw_KeywordOf<oif_CyclicSymmetryModel> {
public:
    oif_CyclicSymmetryModel(const g3d_Vector& start, const g3d_Vector& end, int numberOfSectors)
        : start_(start), end_(end), numberOfSectors_(numberOfSectors) {}
    void Write(utl_Stream& stream) const override;

private:
    g3d_Vector start_;
    g3d_Vector end_;
    int numberOfSectors_;
};

#endif
