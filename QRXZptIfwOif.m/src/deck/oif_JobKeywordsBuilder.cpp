#include "deck/oif_JobKeywordsBuilder.h"

#include "base/oif_Comment.h"

void oif_JobKeywordsBuilder::Build() {
    const cow_String text = Model().Model().topLevelSolverInput();
    if (!text.IsEmpty()) AddModelDefinition(oif_FileHeader(text));
}
