#include "amplitudes/oif_Amplitude.h"

#include "base/oif_ClassRows.h"
#include "base/oif_DataLines.h"
#include "base/oif_KeywordLine.h"
#include "foundation/nex_Exception.h"
#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

constexpr int kNumbersOfLine = 8;

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

oif_KeywordLine& AddDefinition(oif_KeywordLine& line, const char* definition) {
    return line.MayBreak().Fixed(", definition=", definition);
}

// The tabular definition is the solver's own default and has no word.
void WriteCurve(utl_Stream& stream, oif_KeywordLine& line, const kamC_Tabular& curve) {
    line.MayBreak().FixedUnless(", smooth=", curve.smooth, kamC_Tabular::smoothDef()).End();
    WritePairs(stream, curve.table);
}

void WriteCurve(utl_Stream& stream, oif_KeywordLine& line, const kamC_EquallySpaced& curve) {
    AddDefinition(line, "EQUALLY SPACED").MayBreak();
    if (curve.smooth != kamC_EquallySpaced::smoothDef()) line.Fixed(", smooth=", curve.smooth).MayBreak();
    line.Fixed(", fixed interval=", curve.fixedInterval);
    if (curve.begin != kamC_EquallySpaced::beginDef()) line.MayBreak().Fixed(", begin=", curve.begin);
    line.End();
    WriteValues(stream, curve.values);
}

void WriteCurve(utl_Stream& stream, oif_KeywordLine& line, const kamC_Periodic& curve) {
    AddDefinition(line, "PERIODIC").End();
    // Without terms the first data line goes with them.
    if (curve.table.IsEmpty()) return;
    stream << curve.table.NumRows() << ", " << curve.frequency << ", " << curve.start << ", " << curve.a0
           << endl;
    WritePairs(stream, curve.table);
}

void WriteCurve(utl_Stream& stream, oif_KeywordLine& line, const kamC_Modulated& curve) {
    AddDefinition(line, "MODULATED").End();
    stream << curve.initial << ", " << curve.magnitude << ", " << curve.start << ", " << curve.frequency1
           << ", " << curve.frequency2 << endl;
}

void WriteCurve(utl_Stream& stream, oif_KeywordLine& line, const kamC_Decay& curve) {
    AddDefinition(line, "DECAY").End();
    stream << curve.initial << ", " << curve.maximum << ", " << curve.start << ", " << curve.decayTime
           << endl;
}

void WriteCurve(utl_Stream& stream, oif_KeywordLine& line, const kamC_SolutionDependent& curve) {
    AddDefinition(line, "SOLUTION DEPENDENT").End();
    stream << curve.initial << ", " << curve.minimum << ", " << curve.maximum << endl;
}

void WriteCurve(utl_Stream& stream, oif_KeywordLine& line, const kamC_SmoothStep& curve) {
    AddDefinition(line, "SMOOTH STEP").MayBreak().End();
    WritePairs(stream, curve.table);
}

/// How the amplitudes of a class are written behind what all share.
struct CurveRow {
    unsigned typeId;
    void (*write)(utl_Stream& stream, oif_KeywordLine& line, const kamC_Amplitude& record);
};

template <class Curve>
constexpr CurveRow RowOf() {
    return {Curve::Class.Id(), [](utl_Stream& stream, oif_KeywordLine& line, const kamC_Amplitude& record) {
                WriteCurve(stream, line, static_cast<const Curve&>(record));
            }};
}

constexpr CurveRow kCurves[] = {
    RowOf<kamC_Tabular>(), RowOf<kamC_EquallySpaced>(),     RowOf<kamC_Periodic>(),   RowOf<kamC_Modulated>(),
    RowOf<kamC_Decay>(),   RowOf<kamC_SolutionDependent>(), RowOf<kamC_SmoothStep>(),
};

} // namespace

void oif_Amplitude::Write(utl_Stream& stream) const {
    const kamC_Amplitude& record = Record();
    oif_KeywordLine line(stream, "*Amplitude");
    line.Fixed(", name=", qkw_QuorixName(Name(), false)).MayBreak();
    if (record.timeSpan != kamC_Amplitude::timeSpanDef()) {
        line.Fixed(", time=", record.timeSpan).Text(" TIME");
    }
    const CurveRow* row = oif_FindRow(kCurves, record.DynTypeId());
    if (row == nullptr) nex_Raise("Unknown amplitude definition");
    row->write(stream, line, record);
}

void oif_PsdDefinition::Write(utl_Stream& stream) const {
    if (Record().DynTypeId() != kamC_PsdDefinition::TypeId()) return;
    const auto& density = nex_canDynamicCastRef<kamC_PsdDefinition>(Record(), NEX_HERE);
    oif_KeywordLine(stream, "*Psd-Definition")
        .Fixed(", name=", qkw_QuorixName(Name(), false))
        .MayBreak()
        .FixedUnless(", db Reference=", density.dbReference, 0.0)
        .MayBreak()
        .FixedUnless(", g=", density.g, kamC_PsdDefinition::gDef())
        .MayBreak()
        .FixedUnless(", type=", density.psdType, kamC_PsdDefinition::psdTypeDef())
        .MayBreak()
        .FixedIf(density.user, ", user")
        .End();
    WriteRowsOfThree(stream, density.table);
}

void oif_Spectrum::Write(utl_Stream& stream) const {
    if (Record().DynTypeId() != kamC_Spectrum::TypeId()) return;
    const auto& spectrum = nex_canDynamicCastRef<kamC_Spectrum>(Record(), NEX_HERE);
    oif_KeywordLine(stream, "*Spectrum")
        .Fixed(", name=", qkw_QuorixName(Name(), false))
        .MayBreak()
        .FixedUnless(", g=", spectrum.g, 0.0)
        .MayBreak()
        .FixedUnless(", type=", spectrum.type, kamC_Spectrum::TypeEnm::ACCELERATION)
        .End();
    WriteRowsOfThree(stream, spectrum.table);
    // Behind the rows stands an empty line, here only.
    stream << endl;
}

void oif_BaselineCorrection::Write(utl_Stream& stream) const {
    stream << "*Baseline Correction" << endl;
    WriteValues(stream, correction_.intervals);
}
