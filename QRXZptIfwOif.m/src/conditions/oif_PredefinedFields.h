#ifndef QRX_OIF_PREDEFINEDFIELDS_H
#define QRX_OIF_PREDEFINEDFIELDS_H

#include "base/oif_KeywordLine.h"
#include "conditions/oif_Card.h"
#include "conditions/oif_FieldTable.h"
#include "store_interface/records/conditions/kpfC_Fields.h"

/// Text that the field keywords and the initial conditions share.
class oif_FieldText {
public:
    /// A results file without its ending ".fil", in any capitals; a name that is nothing else keeps it.
    static cow_String FileStem(const cow_String& fileName);
    static void WriteFile(oif_KeywordLine& line, const cow_String& fileName);
    /// The parameter with its number, unless it is 0 or wasn't said.
    static void WriteNumber(oif_KeywordLine& line, const char* parameter, const mdl_PropAttr<int>& number);
    /// The steps and increments to read.
    static void WriteFileRange(oif_KeywordLine& line, const kpfC_ResultsFile& file);
    /// ", midside", or ", interpolate" with the tolerances.
    static void WriteInterpolation(oif_KeywordLine& line, const kpfC_TemperatureState& state);

    static int GetNumberOfDataLines(int count, int perLine) { return (count + perLine - 1) / perLine; }
    /// Empty lines until there are as many as `maxSize` values take, eight to a line.
    static void PadLines(utl_Stream& stream, int written, int maxSize);
    /// Set and values on one line whatever their number, then the padding.
    static void WriteValues(utl_Stream& stream, const cow_String& setName,
                            const cow_List<mdl_PropAttr<double>>& values, double scale, int maxSize);
    /// The set, then the values, eight to a line, and the padding.
    static void WriteGeneralFieldBaseData(utl_Stream& stream, const cow_String& setName, int maxSize,
                                          const cow_List<mdl_PropAttr<double>>& values);
};

/// A field in a step:
///     *Keyword, op=NEW, amplitude=Amp-1
///     Set-1, DATA
///     *Keyword, user
///     Set-1
///     *Keyword, user, file=job-1, PARAMETERS
/// A field that ends has its keyword line alone, with op=NEW.
class oif_StepField : public qkw_Keyword {
public:
    void Write(utl_Stream& stream) const override;

protected:
    explicit oif_StepField(const oif_FieldCard& card);

    cow_String setName_;
    mdl_ObjCow<kpfC_FieldState> state_;

private:
    virtual const char* Keyword() const = 0;
    virtual const cow_String& Amplitude() const = 0;
    /// Parameters that stand also where it ends.
    virtual void WriteVariable(oif_KeywordLine&) const {}
    /// The results file; null for a class that reads none.
    virtual const cow_String* FileName() const { return nullptr; }
    virtual void WriteFileParameters(oif_KeywordLine&) const {}
    /// The data lines of a uniform field.
    virtual void WriteData(utl_Stream& stream) const = 0;

    kpfC_Field::DistribTypeEnm distributionType_;
    oif_Op op_;
    bool deactivated_;
};

/// Base of the keyword K of fields whose states are of class S.
template <class K, class S>
class oif_StepFieldOf : public qkw_KeywordOf<K, oif_StepField> {
public:
    explicit oif_StepFieldOf(const oif_FieldCard& card) : qkw_KeywordOf<K, oif_StepField>(card) {}

protected:
    const S& State() const { return static_cast<const S&>(this->state_.ConstGet()); }

private:
    const cow_String& Amplitude() const override { return State().amplitude.ConstGet(); }
};

/// Temperatures in a step, constant or by section points, from a results file, or user-defined:
///     *Temperature, op=NEW, amplitude=Amp-1
///     Set-1, 100., 110.
///     *Temperature, file=job-1, bstep=1, binc=2, interpolate, exterior tolerance=0.1
/// The data takes as many lines as the model's largest temperature field.
class oif_FieldTemperature final : public oif_StepFieldOf<oif_FieldTemperature, kpfC_TemperatureState> {
public:
    oif_FieldTemperature(const oif_FieldCard& card, const kpfC_Temperature&, const oif_FieldSetting& setting)
        : oif_StepFieldOf(card), scale_(card.Factor()), maxSize_(setting.maxTemperatureSize) {}

private:
    const char* Keyword() const override { return "*Temperature"; }
    const cow_String* FileName() const override { return &State().magnitude.ConstGet(); }
    void WriteFileParameters(oif_KeywordLine& line) const override;
    void WriteData(utl_Stream& stream) const override;

    double scale_;
    int maxSize_;
};

/// A field variable in a step:
///     *Field, variable=1, number=2, amplitude=Amp-1
///     Set-1, 100., 110.
/// or from a results file, or user-defined. Values are neither scaled nor padded.
class oif_GeneralField final : public oif_StepFieldOf<oif_GeneralField, kpfC_GeneralFieldState> {
public:
    using oif_StepFieldOf::oif_StepFieldOf;

private:
    const char* Keyword() const override { return "*Field"; }
    void WriteVariable(oif_KeywordLine& line) const override;
    const cow_String* FileName() const override { return &State().fileName.ConstGet(); }
    void WriteFileParameters(oif_KeywordLine& line) const override;
    void WriteData(utl_Stream& stream) const override;
};

/// Equivalent pressure stress, also in the initial step:
///     *Pressure stress, op=NEW, amplitude=Amp-1
///     Set-1, 100.
/// or from a results file, or user-defined.
class oif_PressureStress final : public oif_StepFieldOf<oif_PressureStress, kpfC_PressureStressState> {
public:
    using oif_StepFieldOf::oif_StepFieldOf;

private:
    const char* Keyword() const override { return "*Pressure stress"; }
    const cow_String* FileName() const override { return &State().fileName.ConstGet(); }
    void WriteData(utl_Stream& stream) const override;
};

/// Mass flow rate, also in the initial step:
///     *Mass flow rate, amplitude=Amp-1
///     Set-1, 1., 0., 0.
/// or user-defined.
class oif_MassFlowRate final : public oif_StepFieldOf<oif_MassFlowRate, kpfC_MassFlowRateState> {
public:
    using oif_StepFieldOf::oif_StepFieldOf;

private:
    const char* Keyword() const override { return "*Mass flow rate"; }
    void WriteData(utl_Stream& stream) const override;
};

#endif
