#ifndef QRX_OIF_PREDEFINEDFIELDS_H
#define QRX_OIF_PREDEFINEDFIELDS_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/conditions/kpfC_Fields.h"

/// Text that the field keywords and the initial conditions share.
class oif_FieldText {
public:
    /// A results file without its ending ".fil", in any capitals; a name that is nothing else keeps it.
    static cow_String FileStem(const cow_String& fileName);
    static void WriteFile(utl_Stream& stream, const cow_String& fileName);
    /// With the steps and increments to read.
    static void WriteFile(utl_Stream& stream, const cow_String& fileName, const kpfC_ResultsFile& file);
    /// The parameter with its number, unless it is 0 or wasn't said.
    static void WriteNumber(utl_Stream& stream, const char* parameter, const mdl_PropAttr<int>& number);
    /// ", midside", or ", interpolate" with the tolerances.
    static void WriteInterpolation(utl_Stream& stream, const kpfC_TemperatureState& state);

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

/// What the field keywords of steps share. A field that ends has its keyword line alone, with op=NEW.
class oif_StepField : public qkw_Keyword {
protected:
    oif_StepField(const kpfC_Field& field, const cow_String& stepName, bool opMod, const cow_String& setName);

    template <class State>
    const State& StateAs() const {
        return static_cast<const State&>(state_.ConstGet());
    }
    void WriteOpNew(utl_Stream& stream) const;
    static void WriteAmplitude(utl_Stream& stream, const cow_String& amplitude);
    /// The end of a user-defined field: ", user" and the set.
    void WriteUserData(utl_Stream& stream) const;
    /// ", user" of a field that takes both a file and a user's routine.
    void WriteUserOfFile(utl_Stream& stream) const;

    kpfC_Field::DistribTypeEnm distributionType_;
    cow_String setName_;
    bool opMod_;
    bool deactivated_ = false;

private:
    void CheckDeactivate(mdl_PropagationStatusEnm status);

    mdl_ObjCow<kpfC_FieldState> state_;
};

/// Temperatures in a step, constant or by section points, from a results file, or user-defined:
///     *Temperature, op=NEW, amplitude=Amp-1
///     Set-1, 100., 110.
///     *Temperature, file=job-1, bstep=1, binc=2, interpolate, exterior tolerance=0.1
/// The data takes as many lines as the model's largest temperature field.
class oif_FieldTemperature final : public qkw_KeywordOf<oif_FieldTemperature, oif_StepField> {
public:
    oif_FieldTemperature(const kpfC_Field& field, const cow_String& stepName, bool opMod,
                         const cow_String& setName, int maxSize, double scale)
        : qkw_KeywordOf(field, stepName, opMod, setName), scale_(scale), maxSize_(maxSize) {}
    void Write(utl_Stream& stream) const override;

private:
    double scale_;
    int maxSize_;
};

/// A field variable in a step:
///     *Field, variable=1, number=2, amplitude=Amp-1
///     Set-1, 100., 110.
/// or from a results file, or user-defined. Values are neither scaled nor padded.
class oif_GeneralField final : public qkw_KeywordOf<oif_GeneralField, oif_StepField> {
public:
    oif_GeneralField(const kpfC_Field& field, const cow_String& stepName, bool opMod,
                     const cow_String& setName)
        : qkw_KeywordOf(field, stepName, opMod, setName) {}
    void Write(utl_Stream& stream) const override;
};

/// Equivalent pressure stress, also in the initial step:
///     *Pressure stress, op=NEW, amplitude=Amp-1
///     Set-1, 100.
/// or from a results file, or user-defined.
class oif_PressureStress final : public qkw_KeywordOf<oif_PressureStress, oif_StepField> {
public:
    oif_PressureStress(const kpfC_Field& field, const cow_String& stepName, bool opMod,
                       const cow_String& setName)
        : qkw_KeywordOf(field, stepName, opMod, setName) {}
    void Write(utl_Stream& stream) const override;
};

/// Mass flow rate, also in the initial step:
///     *Mass flow rate, amplitude=Amp-1
///     Set-1, 1., 0., 0.
/// or user-defined.
class oif_MassFlowRate final : public qkw_KeywordOf<oif_MassFlowRate, oif_StepField> {
public:
    oif_MassFlowRate(const kpfC_Field& field, const cow_String& stepName, bool opMod,
                     const cow_String& setName)
        : qkw_KeywordOf(field, stepName, opMod, setName) {}
    void Write(utl_Stream& stream) const override;
};

#endif
