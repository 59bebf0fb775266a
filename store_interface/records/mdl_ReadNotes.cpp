#include "store_interface/records/mdl_ReadNotes.h"

#include <algorithm>
#include <utility>

namespace {

thread_local mdl_ReadNotes* innermost = nullptr;

} // namespace

mdl_ReadNotes::mdl_ReadNotes() : outer_(std::exchange(innermost, this)) {}

mdl_ReadNotes::~mdl_ReadNotes() {
    innermost = outer_;
    for (const unsigned itemTypeId : read_) Note(itemTypeId);
    if (untold_) NoteUntold();
}

void mdl_ReadNotes::Note(unsigned itemTypeId) {
    if (innermost == nullptr) return;
    std::vector<unsigned>& read = innermost->read_;
    if (std::ranges::find(read, itemTypeId) == read.end()) read.push_back(itemTypeId);
}

void mdl_ReadNotes::NoteUntold() {
    if (innermost != nullptr) innermost->untold_ = true;
}

bool mdl_ReadNotes::HasRead(unsigned itemTypeId) const {
    return untold_ || std::ranges::find(read_, itemTypeId) != read_.end();
}
