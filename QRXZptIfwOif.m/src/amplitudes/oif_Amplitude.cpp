#include "amplitudes/oif_Amplitude.h"

#include "base/oif_DataLines.h"
#include "foundation/nex_Exception.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

constexpr int kNumbersOfLine = 8;

template <class E>
cow_String TextOf(E value) {
    return omu_PrimEnum<E, 1>(value).GetString();
}

void WriteValues(utl_Stream& stream, const cow_List<double>& values) {
    oif_DataLines lines(stream, kNumbersOfLine);
    for (int i = 0; i < values.Length(); ++i) lines.Add(values[i]);
    lines.End();
}

// Four rows to a line.
void WritePairs(utl_Stream& stream, const cow_2DArray<double>& table) {
    oif_DataLines lines(stream, kNumbersOfLine);
    for (int i = 0; i < table.NumRows(); ++i) lines.Add(table.ConstGet(i, 0)).Add(table.ConstGet(i, 1));
    lines.End();
}

void WriteRowsOfThree(utl_Stream& stream, const cow_2DArray<double>& table) {
    oif_DataLines lines(stream, 3);
    for (int i = 0; i < table.NumRows(); ++i) {
        for (int j = 0; j < 3; ++j) lines.Add(table.ConstGet(i, j));
    }
}

void WriteDefinition(utl_Stream& stream, const char* definition) {
    stream.OptionalLineBreak();
    stream << ", definition=" << definition;
}

// The tabular definition is the solver's own default and has no word.
void WriteCurve(utl_Stream& stream, const kamC_Tabular& curve) {
    stream.OptionalLineBreak();
    if (curve.smooth != kamC_Tabular::smoothDef()) stream << ", smooth=" << curve.smooth;
    stream << endl;
    WritePairs(stream, curve.table);
}

void WriteCurve(utl_Stream& stream, const kamC_EquallySpaced& curve) {
    WriteDefinition(stream, "EQUALLY SPACED");
    stream.OptionalLineBreak();
    if (curve.smooth != kamC_EquallySpaced::smoothDef()) {
        stream << ", smooth=" << curve.smooth;
        stream.OptionalLineBreak();
    }
    stream << ", fixed interval=" << curve.fixedInterval;
    if (curve.begin != kamC_EquallySpaced::beginDef()) {
        stream.OptionalLineBreak();
        stream << ", begin=" << curve.begin;
    }
    stream << endl;
    WriteValues(stream, curve.values);
}

void WriteCurve(utl_Stream& stream, const kamC_Periodic& curve) {
    WriteDefinition(stream, "PERIODIC");
    stream << endl;
    // Without terms the first data line goes with them.
    if (curve.table.IsEmpty()) return;
    stream << curve.table.NumRows() << ", " << curve.frequency << ", " << curve.start << ", " << curve.a0
           << endl;
    WritePairs(stream, curve.table);
}

void WriteCurve(utl_Stream& stream, const kamC_Modulated& curve) {
    WriteDefinition(stream, "MODULATED");
    stream << endl
           << curve.initial << ", " << curve.magnitude << ", " << curve.start << ", " << curve.frequency1
           << ", " << curve.frequency2 << endl;
}

void WriteCurve(utl_Stream& stream, const kamC_Decay& curve) {
    WriteDefinition(stream, "DECAY");
    stream << endl
           << curve.initial << ", " << curve.maximum << ", " << curve.start << ", " << curve.decayTime
           << endl;
}

void WriteCurve(utl_Stream& stream, const kamC_SolutionDependent& curve) {
    WriteDefinition(stream, "SOLUTION DEPENDENT");
    stream << endl << curve.initial << ", " << curve.minimum << ", " << curve.maximum << endl;
}

void WriteCurve(utl_Stream& stream, const kamC_SmoothStep& curve) {
    WriteDefinition(stream, "SMOOTH STEP");
    stream.OptionalLineBreak();
    stream << endl;
    WritePairs(stream, curve.table);
}

template <class Curve>
bool WriteIf(utl_Stream& stream, const kamC_Amplitude& record) {
    if (record.DynTypeId() != Curve::TypeId()) return false;
    WriteCurve(stream, nex_canDynamicCastRef<Curve>(record, NEX_HERE));
    return true;
}

template <class... Curves>
bool WriteAnyOf(utl_Stream& stream, const kamC_Amplitude& record) {
    return (WriteIf<Curves>(stream, record) || ...);
}

} // namespace

void oif_Amplitude::Write(utl_Stream& stream) const {
    stream << "*Amplitude, name=" << qkw_QuorixName(Name(), false);
    stream.OptionalLineBreak();
    const kamC_Amplitude& record = Record();
    if (record.timeSpan != kamC_Amplitude::timeSpanDef()) {
        stream << ", time=" << TextOf(record.timeSpan) << " TIME";
    }
    if (!WriteAnyOf<kamC_Tabular, kamC_EquallySpaced, kamC_Periodic, kamC_Modulated, kamC_Decay,
                    kamC_SolutionDependent, kamC_SmoothStep>(stream, record)) {
        nex_Raise("Unknown amplitude definition");
    }
}

void oif_PsdDefinition::Write(utl_Stream& stream) const {
    if (Record().DynTypeId() != kamC_PsdDefinition::TypeId()) return;
    const auto& density = nex_canDynamicCastRef<kamC_PsdDefinition>(Record(), NEX_HERE);
    stream << "*Psd-Definition, name=" << qkw_QuorixName(Name(), false);
    stream.OptionalLineBreak();
    if (density.dbReference != 0.0) stream << ", db Reference=" << density.dbReference;
    stream.OptionalLineBreak();
    if (density.g != kamC_PsdDefinition::gDef()) stream << ", g=" << density.g;
    stream.OptionalLineBreak();
    if (density.psdType != kamC_PsdDefinition::psdTypeDef()) stream << ", type=" << TextOf(density.psdType);
    stream.OptionalLineBreak();
    if (density.user) stream << ", user";
    stream << endl;
    WriteRowsOfThree(stream, density.table);
}

void oif_Spectrum::Write(utl_Stream& stream) const {
    if (Record().DynTypeId() != kamC_Spectrum::TypeId()) return;
    const auto& spectrum = nex_canDynamicCastRef<kamC_Spectrum>(Record(), NEX_HERE);
    stream << "*Spectrum, name=" << qkw_QuorixName(Name(), false);
    stream.OptionalLineBreak();
    if (spectrum.g != 0.0) stream << ", g=" << spectrum.g;
    stream.OptionalLineBreak();
    if (spectrum.type != kamC_Spectrum::TypeEnm::ACCELERATION) stream << ", type=" << TextOf(spectrum.type);
    stream << endl;
    WriteRowsOfThree(stream, spectrum.table);
    // Behind the rows stands an empty line, here only.
    stream << endl;
}

void oif_BaselineCorrection::Write(utl_Stream& stream) const {
    stream << "*Baseline Correction" << endl;
    WriteValues(stream, correction_.intervals);
}
