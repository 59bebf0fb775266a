#ifndef QRX_OIF_SPECIALOPTIONS_H
#define QRX_OIF_SPECIALOPTIONS_H

#include "materials/oif_MaterialOption.h"
#include "materials/oif_MaterialTable.h"
#include "materials/oif_OptionLine.h"

// The options that do more than a row of oif_MaterialOption.cpp can tell.
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_AcousticMedium& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_BiaxialTestData& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_ClayPlasticity& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_ContactArea& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_DruckerPrager& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_DruckerPragerHardening& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_MembraneElastic& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_PlanarTestData& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_Plastic& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_Sorption& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_ThicknessBehavior& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_TransShearElastic& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_UniaxialTestData& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_UserMaterial& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_Viscoelastic& option);
void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_VolumetricTestData& option);

/// A table in which nothing is inserted.
oif_MaterialTable oif_PlainTable(const kmaC_MaterialTable& values);

/// One data line, or more of eight cells each.
template <class Values>
oif_MaterialTable oif_TableOfOneRow(const Values& values, int count) {
    kmaC_MaterialTable row(count > 0 ? 1 : 0, count);
    for (int i = 0; i < count; ++i) row.Put(0, i, values(i));
    return oif_PlainTable(row);
}

#endif
