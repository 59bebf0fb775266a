#ifndef QRX_STORE_DDR_SHORTCUT_H
#define QRX_STORE_DDR_SHORTCUT_H

#include "foundation/cow_String.h"

/// The place of an object in the store: a path such as "rootAssembly.mesh[2].setData[5]", and the object's
/// own name. A default one has no value.
class ddr_Shortcut {
public:
    ddr_Shortcut() = default;
    ddr_Shortcut(const cow_String& path, const cow_String& name) : path_(path), name_(name) {}
    bool HasValue() const { return !path_.IsEmpty(); }
    const cow_String& Path() const { return path_; }
    const cow_String& Name() const { return name_; }
    friend bool operator==(const ddr_Shortcut& a, const ddr_Shortcut& b) { return a.path_ == b.path_; }

private:
    cow_String path_;
    cow_String name_;
};

/// A shortcut that can be followed to its object, which the store keeps alive.
template <class T>
class ddr_ShortcutTo : public ddr_Shortcut {
public:
    ddr_ShortcutTo(const cow_String& path, const cow_String& name, const T& target)
        : ddr_Shortcut(path, name), target_(&target) {}
    const T& ConstGet() const { return *target_; }

private:
    const T* target_;
};

#endif
