#include "store_interface/records/mdl_Repository.h"

cow_List<cow_String> mdl_Repository::Keys() const {
    cow_List<cow_String> keys{cow_ListConstruct(Size())};
    if (!Read().IsNull()) {
        for (const auto& [name, record] : records_.ConstGet()) keys.Append(name);
    }
    return keys;
}

const mdl_ObjCow<cls_Record>* mdl_Repository::ConstHolder(const cow_String& name) const {
    if (Read().IsNull()) return nullptr;
    const auto place = records_.ConstGet().find(name);
    return place == records_.ConstGet().end() ? nullptr : &place->second;
}

const cls_Record* mdl_Repository::FindRecord(const cow_String& name) const {
    const mdl_ObjCow<cls_Record>* holder = ConstHolder(name);
    return holder == nullptr ? nullptr : holder->Referent();
}

const cls_Record& mdl_Repository::ConstGetRecord(const cow_String& name) const {
    const cls_Record* record = FindRecord(name);
    if (record == nullptr) cow_RaiseNoSuchKey(name_, name);
    return *record;
}

cls_Record& mdl_Repository::WritableRecord(const cow_String& name) {
    if (!IsMember(name)) cow_RaiseNoSuchKey(name_, name);
    return Holder(name).Get();
}

void mdl_Repository::InsertRecord(const cow_String& name, const cls_Record& record) {
    mdl_ObjCow<cls_Record> copy(record);
    Holder(name) = std::move(copy);
}

bool mdl_Repository::Remove(const cow_String& name) {
    return IsMember(name) && records_.Get().erase(name) == 1;
}

mdl_ObjCow<cls_Record>& mdl_Repository::Holder(const cow_String& name) {
    if (records_.IsNull()) records_.Reset(new Records());
    return records_.Get()[name];
}

bool cls_RepositoryType::Equal(const void* a, const void* b) const {
    const cow_List<cow_String> keys = Keys(a);
    if (!(keys == Keys(b))) return false;
    for (int i = 0; i < keys.Length(); ++i) {
        if (!cls_HeldEqual(At(a).FindRecord(keys[i]), At(b).FindRecord(keys[i]))) return false;
    }
    return true;
}

const void* cls_RepositoryType::Item(const void* value, const cow_String& key) const {
    const mdl_ObjCow<cls_Record>* holder = At(value).ConstHolder(key);
    if (holder == nullptr) cow_RaiseNoSuchKey(At(value).ContainerName(), key);
    return holder;
}

void cls_RepositoryType::Clear(void* value) const {
    At(value).Clear();
}

void* cls_RepositoryType::Insert(void* value, const cow_String& key) const {
    return &At(value).Holder(key);
}

const cls_Record* cls_RepositoryItemType::Get(const void* value) const {
    return static_cast<const mdl_ObjCow<cls_Record>*>(value)->Referent();
}

cls_Record* cls_RepositoryItemType::Writable(void* value) const {
    auto& holder = *static_cast<mdl_ObjCow<cls_Record>*>(value);
    return holder.IsNull() ? nullptr : &holder.Get();
}

void cls_RepositoryItemType::Set(void* value, const cls_Record* record) const {
    *static_cast<mdl_ObjCow<cls_Record>*>(value) =
        record == nullptr ? mdl_ObjCow<cls_Record>() : mdl_ObjCow<cls_Record>(*record);
}
