#ifndef QRX_STORE_BME_ELEMCTRLPARAMS_H
#define QRX_STORE_BME_ELEMCTRLPARAMS_H

#include "store_interface/records/cls_FieldTable.h"

class cls_ClassRegistrar;

/// Which solver's elements are meant.
enum class bme_ElemLibrary : int { NONE = 0, STANDARD = 1, EXPLICIT = 2 };
const omu_EnumTable& omu_EnumTableOf(bme_ElemLibrary);

/// Element controls of an element class of a mesh.
class bme_ElemCtrlParams final : public cls_RecordOf<bme_ElemCtrlParams> {
public:
    static constexpr cls_ClassInfo Class{"bme_ElemCtrlParams", "element controls of an element class"};

    enum class DistortionControlEnm : int { DEFAULT = 0, YES = 1, NO = 2 };
    enum class KinematicSplitEnm : int { DEFAULT = 0, AVERAGE_STRAIN = 1, ORTHOGONAL = 2, CENTROID = 3 };
    enum class HourglassEnm : int {
        DEFAULT = 0,
        RELAX_STIFFNESS = 1,
        STIFFNESS = 2,
        VISCOUS = 3,
        COMBINED = 4,
        ENHANCED = 5
    };
    enum class SecondOrderAccuracyEnm : int { DEFAULT = 0, YES = 1, NO = 2 };
    enum class StressRateEnm : int { DEFAULT = 0, JAUMANN = 1, SPIN = 2 };

    DistortionControlEnm distortionControl = DistortionControlEnm::DEFAULT;
    double lengthRatio = 0.1;
    KinematicSplitEnm kinematicSplit = KinematicSplitEnm::DEFAULT;
    HourglassEnm hourglass = HourglassEnm::DEFAULT;
    SecondOrderAccuracyEnm secondOrderAccuracy = SecondOrderAccuracyEnm::DEFAULT;
    StressRateEnm stressRate = StressRateEnm::DEFAULT;
    double weightFactor = 0.5;
    double displacementHourglass = 1.0;
    double rotationalHourglass = 1.0;
    double outOfPlaneHourglass = 1.0;
    double linearBulkViscosity = 1.0;
    double quadraticBulkViscosity = 1.0;
    double hourglassStiffness = 0.0;
    double bendingHourglassStiffness = 0.0;
    double drillingHourglassScaling = 0.0;

    /// Keeps the library; neither equality nor the tests below look at it.
    void SetElemLibrary(bme_ElemLibrary library) { library_ = library; }
    bme_ElemLibrary ElemLibrary() const { return library_; }
    /// Without a library always true. Otherwise: all enumerations at their defaults, all factors within 1e-6
    /// of theirs; for the implicit solver the three hourglass stiffness values must be exactly 0 as well.
    bool IsDefault(bme_ElemLibrary library) const;
    /// The same as IsDefault, so that every name of controls that a section refers to is written.
    bool HasDefaultSectionControls(bme_ElemLibrary library) const { return IsDefault(library); }
    /// Any of the fields differs, compared exactly.
    friend bool operator!=(const bme_ElemCtrlParams& a, const bme_ElemCtrlParams& b) {
        return !cls_RecordsEqual(a, b);
    }
    friend bool operator==(const bme_ElemCtrlParams& a, const bme_ElemCtrlParams& b) {
        return cls_RecordsEqual(a, b);
    }

    static const cls_FieldTable& Fields();

private:
    bme_ElemLibrary library_ = bme_ElemLibrary::NONE;
};
const omu_EnumTable& omu_EnumTableOf(bme_ElemCtrlParams::DistortionControlEnm);
const omu_EnumTable& omu_EnumTableOf(bme_ElemCtrlParams::KinematicSplitEnm);
const omu_EnumTable& omu_EnumTableOf(bme_ElemCtrlParams::HourglassEnm);
const omu_EnumTable& omu_EnumTableOf(bme_ElemCtrlParams::SecondOrderAccuracyEnm);
const omu_EnumTable& omu_EnumTableOf(bme_ElemCtrlParams::StressRateEnm);

void cls_RegisterElementControlRecords(cls_ClassRegistrar& registrar);

#endif
