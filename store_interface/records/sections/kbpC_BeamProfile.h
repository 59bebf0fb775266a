#ifndef QRX_STORE_KBPC_BEAMPROFILE_H
#define QRX_STORE_KBPC_BEAMPROFILE_H

#include "store_interface/records/cls_FieldTable.h"

class cls_ClassRegistrar;

class kbpC_BeamProfile : public cls_AbstractRecordOf<kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_BeamProfile",
                                         "cross-section of beams; held by name in the model"};
};

class kbpC_GeneralizedProfile final : public cls_RecordOf<kbpC_GeneralizedProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{
        "kbpC_GeneralizedProfile",
        "cross-section given by its properties; only a general section writes them", 0, "Generalized"};

    double area = 0.0;
    double i11 = 0.0;
    double i12 = 0.0;
    double i22 = 0.0;
    double j = 0.0;
    double gammaO = 0.0;
    double gammaW = 0.0;

    static const cls_FieldTable& Fields();
};

class kbpC_CircularProfile final : public cls_RecordOf<kbpC_CircularProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_CircularProfile", "solid circle", 0, "Circular Circle"};

    double r = 0.0;

    static const cls_FieldTable& Fields();
};

class kbpC_HexagonalProfile final : public cls_RecordOf<kbpC_HexagonalProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_HexagonalProfile", "hollow hexagon", 0, "Hexagonal Hexagon"};

    double r = 0.0;
    double t = 0.0;

    static const cls_FieldTable& Fields();
};

class kbpC_PipeProfile final : public cls_RecordOf<kbpC_PipeProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_PipeProfile", "pipe", 0, "Pipe"};

    double r = 0.0;
    double t = 0.0;
    int formulation = 0;

    static const cls_FieldTable& Fields();
};

class kbpC_IbeamProfile final : public cls_RecordOf<kbpC_IbeamProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_IbeamProfile", "I section", 0, "I IProfile IBeam"};

    double l = 0.0;
    double h = 0.0;
    double b1 = 0.0;
    double b2 = 0.0;
    double t1 = 0.0;
    double t2 = 0.0;
    double t3 = 0.0;

    static const cls_FieldTable& Fields();
};

class kbpC_BoxProfile final : public cls_RecordOf<kbpC_BoxProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_BoxProfile", "hollow rectangle", 0, "Box"};

    double a = 0.0;
    double b = 0.0;
    bool uniformThickness = false;
    double t1 = 0.0;
    double t2 = 0.0;
    double t3 = 0.0;
    double t4 = 0.0;

    static const cls_FieldTable& Fields();
};

class kbpC_ArbitraryProfile final : public cls_RecordOf<kbpC_ArbitraryProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_ArbitraryProfile", "thin-walled profile of straight segments",
                                         0, "Arbitrary"};

    cow_2DArray<double> table;

    static const cls_FieldTable& Fields();
};

class kbpC_RectangularProfile final : public cls_RecordOf<kbpC_RectangularProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_RectangularProfile", "solid rectangle", 0,
                                         "Rectangular Rectangle"};

    double a = 0.0;
    double b = 0.0;

    static const cls_FieldTable& Fields();
};

class kbpC_LbeamProfile final : public cls_RecordOf<kbpC_LbeamProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_LbeamProfile", "L section", 0, "L LProfile LBeam"};

    double a = 0.0;
    double b = 0.0;
    double t1 = 0.0;
    double t2 = 0.0;

    static const cls_FieldTable& Fields();
};

class kbpC_TbeamProfile final : public cls_RecordOf<kbpC_TbeamProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_TbeamProfile",
                                         "T section; written as an I section without a bottom flange", 0,
                                         "T TProfile TBeam"};

    double b = 0.0;
    double h = 0.0;
    double l = 0.0;
    double tf = 0.0;
    double tw = 0.0;

    static const cls_FieldTable& Fields();
};

class kbpC_TrapezoidalProfile final : public cls_RecordOf<kbpC_TrapezoidalProfile, kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_TrapezoidalProfile", "solid trapezoid", 0,
                                         "Trapezoidal Trapezoid"};

    double a = 0.0;
    double b = 0.0;
    double c = 0.0;
    double d = 0.0;

    static const cls_FieldTable& Fields();
};

void cls_RegisterBeamProfileRecords(cls_ClassRegistrar& registrar);

#endif
