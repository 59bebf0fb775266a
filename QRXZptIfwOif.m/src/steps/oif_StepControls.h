#ifndef QRX_OIF_STEPCONTROLS_H
#define QRX_OIF_STEPCONTROLS_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/steps/kprC_Controls.h"
#include "store_interface/records/steps/kprC_Step.h"

/// Solution controls of a step: the controls are reset, then one block for each list that differs from its
/// default. A block has the entries that differ at their places, eight a line:
///     *Controls, reset
///     *Controls, analysis=discontinuous
///     *Controls, parameters=time incrementation
///     , , , 20, , , , , , ,
///     *Controls, parameters=field, field=temperature
///     0.01, , , , , , ,
/// Default controls write nothing.
class oif_Controls : public qkw_Keyword {
public:
    /// Whether the step solves by the quasi-Newton technique; nothing of that stands in a deck.
    explicit oif_Controls(bool quasiNewton) : quasiNewton_(quasiNewton) {}
    bool QuasiNewton() const { return quasiNewton_; }
    void Write(utl_Stream& stream) const override;

protected:
    virtual const kprC_PrimaryControls& Record() const = 0;
    /// What stands behind the reset.
    virtual void WriteBlocks(utl_Stream& stream) const = 0;

    void WritePrimaryControls(utl_Stream& stream, const kprC_PrimaryControls& primaryControls) const;
    /// The block of a field, if it has something to say.
    void WriteFieldControls(utl_Stream& stream, const char* field, const cow_List<double>& values,
                            const cow_List<double>& defaults) const;
    /// The data lines of a field. Lists of unequal length, or of fewer than four entries, give an empty line.
    void PrintFieldData(utl_Stream& stream, const cow_List<double>& values,
                        const cow_List<double>& defaults) const;
    /// The entries `first` to `last`, up to the last line that has one to write; that line stays open. The
    /// entry `excluded` is never written (-1: none).
    void PrintControlsData(utl_Stream& stream, const cow_List<double>& values,
                           const cow_List<double>& defaults, int first, int last, int excluded, bool) const;

private:
    bool quasiNewton_;
};

class oif_TypicalControls : public qkw_KeywordOf<oif_TypicalControls, oif_Controls> {
public:
    oif_TypicalControls(const kprC_TypicalControls& controls, bool quasiNewton)
        : qkw_KeywordOf(quasiNewton), controls_(controls) {}

protected:
    const kprC_TypicalControls& Record() const override { return controls_.ConstGet(); }
    void WriteBlocks(utl_Stream& stream) const override { WriteTypicalControls(stream); }
    void WriteTypicalControls(utl_Stream& stream) const;

private:
    mdl_ObjCow<kprC_TypicalControls> controls_;
};

class oif_HeatTransferControls : public qkw_KeywordOf<oif_HeatTransferControls, oif_Controls> {
public:
    oif_HeatTransferControls(const kprC_HeatTransferControls& controls, bool quasiNewton)
        : qkw_KeywordOf(quasiNewton), controls_(controls) {}

protected:
    const kprC_HeatTransferControls& Record() const override { return controls_.ConstGet(); }
    void WriteBlocks(utl_Stream& stream) const override { WriteHeatTransferControls(stream); }
    void WriteHeatTransferControls(utl_Stream& stream) const;

private:
    mdl_ObjCow<kprC_HeatTransferControls> controls_;
};

/// Has the block of its field only: the primary lists of its record are never written.
class oif_MassDiffusionControls final : public qkw_KeywordOf<oif_MassDiffusionControls, oif_Controls> {
public:
    oif_MassDiffusionControls(const kprC_MassDiffusionControls& controls, bool quasiNewton)
        : qkw_KeywordOf(quasiNewton), controls_(controls) {}

protected:
    const kprC_MassDiffusionControls& Record() const override { return controls_.ConstGet(); }
    void WriteBlocks(utl_Stream& stream) const override;

private:
    mdl_ObjCow<kprC_MassDiffusionControls> controls_;
};

/// Base of the class T, which has one field more than Base: the list `values` of its record, called
/// T::Field.
template <class T, class Base, class Controls, auto values>
class oif_ControlsWithField : public qkw_KeywordOf<T, Base> {
public:
    oif_ControlsWithField(const Controls& controls, bool quasiNewton)
        : qkw_KeywordOf<T, Base>(controls, quasiNewton) {}

protected:
    void WriteBlocks(utl_Stream& stream) const override {
        Base::WriteBlocks(stream);
        this->WriteFieldControls(stream, T::Field, static_cast<const Controls&>(this->Record()).*values,
                                 kprC_PrimaryControls::fieldDef(false));
    }
};

class oif_CTDControls final : public oif_ControlsWithField<oif_CTDControls, oif_TypicalControls,
                                                           kprC_CTDControls, &kprC_CTDControls::temperature> {
public:
    using oif_ControlsWithField::oif_ControlsWithField;
    static constexpr char Field[] = "temperature";
};

class oif_PoreControls final
    : public oif_ControlsWithField<oif_PoreControls, oif_TypicalControls, kprC_PoreControls,
                                   &kprC_PoreControls::poreFluidPressure> {
public:
    using oif_ControlsWithField::oif_ControlsWithField;
    static constexpr char Field[] = "pore fluid pressure";
};

class oif_ElectricalControls final
    : public oif_ControlsWithField<oif_ElectricalControls, oif_TypicalControls, kprC_ElectricalControls,
                                   &kprC_ElectricalControls::electricalPotential> {
public:
    using oif_ControlsWithField::oif_ControlsWithField;
    static constexpr char Field[] = "electrical potential";
};

class oif_CTEControls final
    : public oif_ControlsWithField<oif_CTEControls, oif_HeatTransferControls, kprC_CTEControls,
                                   &kprC_CTEControls::electricalPotential> {
public:
    using oif_ControlsWithField::oif_ControlsWithField;
    static constexpr char Field[] = "electrical potential";
};

/// Controls of the iterative equation solver; a value of 0 leaves its place empty:
///     *Solver Controls, reset
///     *Solver Controls
///     1e-06, 300
class oif_SolverControls final : public qkw_KeywordOf<oif_SolverControls> {
public:
    explicit oif_SolverControls(const kprC_LinearCtrl& controls) : controls_(controls) {}
    void Write(utl_Stream& stream) const override;

private:
    kprC_LinearCtrl controls_;
};

/// `*Solution Technique, type=SEPARATED` in coupled temperature-displacement and thermal-electric steps that
/// ask for it; nothing in any other step. The step must outlive the keyword.
class oif_SolutionTechnique final : public qkw_KeywordOf<oif_SolutionTechnique> {
public:
    explicit oif_SolutionTechnique(const kprC_AnalysisStep& step) : step_(&step) {}
    void Write(utl_Stream& stream) const override;

private:
    const kprC_AnalysisStep* step_;
};

#endif
