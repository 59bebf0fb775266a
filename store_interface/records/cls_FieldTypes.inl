// Field types of the C++ types that records are made of; part of cls_FieldTable.h.

/// Equality and assignment by the C++ type's own operators, on top of one of the type classes.
template <class T, class TypeClass>
class cls_TypedField : public TypeClass {
public:
    using TypeClass::TypeClass;
    bool Equal(const void* a, const void* b) const override { return At(a) == At(b); }
    void Assign(void* to, const void* from) const override { At(to) = At(from); }

protected:
    static T& At(void* value) { return *static_cast<T*>(value); }
    static const T& At(const void* value) { return *static_cast<const T*>(value); }
};

template <class T, cls_FieldKind Kind>
struct cls_PlainTypeOf {
    static const cls_FieldType& Instance() {
        static const cls_TypedField<T, cls_FieldType> type(Kind);
        return type;
    }
};

template <>
struct cls_TypeOf<bool> : cls_PlainTypeOf<bool, cls_FieldKind::Bool> {};
template <>
struct cls_TypeOf<int> : cls_PlainTypeOf<int, cls_FieldKind::Int> {};
template <>
struct cls_TypeOf<double> : cls_PlainTypeOf<double, cls_FieldKind::Double> {};
template <>
struct cls_TypeOf<float> : cls_PlainTypeOf<float, cls_FieldKind::Float> {};
template <>
struct cls_TypeOf<cow_String> : cls_PlainTypeOf<cow_String, cls_FieldKind::String> {};
template <>
struct cls_TypeOf<gsl_ModelSegment> : cls_PlainTypeOf<gsl_ModelSegment, cls_FieldKind::Segment> {};
template <>
struct cls_TypeOf<omi_complex> : cls_PlainTypeOf<omi_complex, cls_FieldKind::Complex> {};

template <class E>
struct cls_TypeOf<E, std::enable_if_t<std::is_enum_v<E>>> {
    class Type : public cls_TypedField<E, cls_EnumType> {
    public:
        Type() : cls_TypedField<E, cls_EnumType>(omu_EnumTableOf(E())) {}
        int Get(const void* value) const override { return static_cast<int>(this->At(value)); }
        void Set(void* value, int number) const override { this->At(value) = static_cast<E>(number); }
    };
    static const cls_FieldType& Instance() {
        static const Type type;
        return type;
    }
};

inline void cls_GetTriple(const g3d_Vector& v, double (&xyz)[3]) {
    xyz[0] = v.x;
    xyz[1] = v.y;
    xyz[2] = v.z;
}
template <class T>
void cls_GetTriple(const T& v, double (&xyz)[3]) {
    xyz[0] = v.X();
    xyz[1] = v.Y();
    xyz[2] = v.Z();
}

template <class T>
struct cls_TripleTypeOf {
    class Type : public cls_TypedField<T, cls_TripleType> {
    public:
        void Get(const void* value, double (&xyz)[3]) const override { cls_GetTriple(this->At(value), xyz); }
        void Set(void* value, const double (&xyz)[3]) const override {
            this->At(value) = T{xyz[0], xyz[1], xyz[2]};
        }
    };
    static const cls_FieldType& Instance() {
        static const Type type;
        return type;
    }
};
template <>
struct cls_TypeOf<gsl_Point> : cls_TripleTypeOf<gsl_Point> {};
template <>
struct cls_TypeOf<gsl_Vector> : cls_TripleTypeOf<gsl_Vector> {};
template <>
struct cls_TypeOf<g3d_Vector> : cls_TripleTypeOf<g3d_Vector> {};

/// Three numbers of single precision.
template <>
struct cls_TypeOf<float[3]> {
    class Type : public cls_TripleType {
    public:
        bool Equal(const void* a, const void* b) const override {
            return std::equal(At(a), At(a) + 3, At(b));
        }
        void Assign(void* to, const void* from) const override { std::copy(At(from), At(from) + 3, At(to)); }
        void Get(const void* value, double (&xyz)[3]) const override {
            std::copy(At(value), At(value) + 3, xyz);
        }
        void Set(void* value, const double (&xyz)[3]) const override {
            for (int i = 0; i < 3; ++i) At(value)[i] = static_cast<float>(xyz[i]);
        }
        bool IsSingle() const override { return true; }

    private:
        static float* At(void* value) { return static_cast<float*>(value); }
        static const float* At(const void* value) { return static_cast<const float*>(value); }
    };
    static const cls_FieldType& Instance() {
        static const Type type;
        return type;
    }
};

template <>
struct cls_TypeOf<cow_2DArray<double>> {
    class Type : public cls_TypedField<cow_2DArray<double>, cls_TableType> {
    public:
        const cow_2DArray<double>& Get(const void* value) const override { return At(value); }
        void Set(void* value, const cow_2DArray<double>& cells) const override { At(value) = cells; }
    };
    static const cls_FieldType& Instance() {
        static const Type type;
        return type;
    }
};

template <class T>
struct cls_TypeOf<cow_List<T>> {
    class Type : public cls_ListType {
    public:
        Type() : cls_ListType(cls_TypeOf<T>::Instance()) {}
        bool Equal(const void* a, const void* b) const override {
            if (Length(a) != Length(b)) return false;
            for (int i = 0; i < Length(a); ++i) {
                if (!ItemType().Equal(Item(a, i), Item(b, i))) return false;
            }
            return true;
        }
        void Assign(void* to, const void* from) const override { At(to) = At(from); }
        int Length(const void* value) const override { return At(value).Length(); }
        const void* Item(const void* value, int index) const override { return &At(value).ConstGet(index); }
        void* WritableItem(void* value, int index) const override { return &At(value).Get(index); }
        void Clear(void* value) const override { At(value) = cow_List<T>(); }
        void* Append(void* value) const override {
            At(value).Append(T());
            return &At(value).Get(At(value).Length() - 1);
        }

    private:
        static cow_List<T>& At(void* value) { return *static_cast<cow_List<T>*>(value); }
        static const cow_List<T>& At(const void* value) { return *static_cast<const cow_List<T>*>(value); }
    };
    static const cls_FieldType& Instance() {
        static const Type type;
        return type;
    }
};

/// Numbers by name, such as the scale factors of a load case.
template <class V>
struct cls_TypeOf<cow_Map<cow_String, V>> {
    using Map = cow_Map<cow_String, V>;
    class Type : public cls_MapType {
    public:
        Type() : cls_MapType(cls_TypeOf<V>::Instance()) {}
        bool Equal(const void* a, const void* b) const override {
            const cow_List<cow_String> keys = Keys(a);
            if (!(keys == Keys(b))) return false;
            for (int i = 0; i < keys.Length(); ++i) {
                if (!ItemType().Equal(Item(a, keys[i]), Item(b, keys[i]))) return false;
            }
            return true;
        }
        void Assign(void* to, const void* from) const override { At(to) = At(from); }
        cow_List<cow_String> Keys(const void* value) const override {
            std::vector<cow_String> sorted;
            for (cow_ConstMapIterator<cow_String, V> it(At(value)); !it.IsDone(); it.Next()) {
                sorted.push_back(it.CurrentKey());
            }
            std::sort(sorted.begin(), sorted.end());
            cow_List<cow_String> keys;
            for (const cow_String& key : sorted) keys.Append(key);
            return keys;
        }
        const void* Item(const void* value, const cow_String& key) const override {
            return &At(value).ConstGet(key);
        }
        void Clear(void* value) const override { At(value) = Map(); }
        void* Insert(void* value, const cow_String& key) const override {
            return &At(value).GetOrInsert(key);
        }

    private:
        static Map& At(void* value) { return *static_cast<Map*>(value); }
        static const Map& At(const void* value) { return *static_cast<const Map*>(value); }
    };
    static const cls_FieldType& Instance() {
        static const Type type;
        return type;
    }
};

inline bool cls_HeldEqual(const cls_Record* a, const cls_Record* b) {
    if (a == nullptr || b == nullptr) return a == b;
    return cls_RecordsEqual(*a, *b);
}

/// A record as a member by value.
template <class T>
struct cls_TypeOf<T, std::enable_if_t<std::is_base_of_v<cls_Record, T>>> {
    class Type : public cls_HolderType {
    public:
        Type() : cls_HolderType(cls_FieldKind::Record, [] { return T::TypeId(); }) {}
        bool Equal(const void* a, const void* b) const override { return cls_HeldEqual(Get(a), Get(b)); }
        void Assign(void* to, const void* from) const override {
            *static_cast<T*>(to) = *static_cast<const T*>(from);
        }
        const cls_Record* Get(const void* value) const override { return static_cast<const T*>(value); }
        cls_Record* Writable(void* value) const override { return static_cast<T*>(value); }
        void Set(void* value, const cls_Record* record) const override {
            *static_cast<T*>(value) = record == nullptr ? T() : static_cast<const T&>(*record);
        }
    };
    static const cls_FieldType& Instance() {
        static const Type type;
        return type;
    }
};

/// A record that may be absent; of any class derived from T when T is abstract or has classes below it.
template <class T>
struct cls_TypeOf<mdl_ObjCow<T>> {
    class Type : public cls_HolderType {
    public:
        Type()
            : cls_HolderType(std::is_final_v<T> ? cls_FieldKind::Optional : cls_FieldKind::Variant,
                             [] { return T::TypeId(); }) {}
        bool Equal(const void* a, const void* b) const override { return cls_HeldEqual(Get(a), Get(b)); }
        void Assign(void* to, const void* from) const override { At(to) = At(from); }
        const cls_Record* Get(const void* value) const override { return At(value).Referent(); }
        cls_Record* Writable(void* value) const override {
            return At(value).IsNull() ? nullptr : &At(value).Get();
        }
        void Set(void* value, const cls_Record* record) const override {
            At(value) = record == nullptr ? mdl_ObjCow<T>() : mdl_ObjCow<T>(static_cast<const T&>(*record));
        }

    private:
        static mdl_ObjCow<T>& At(void* value) { return *static_cast<mdl_ObjCow<T>*>(value); }
        static const mdl_ObjCow<T>& At(const void* value) {
            return *static_cast<const mdl_ObjCow<T>*>(value);
        }
    };
    static const cls_FieldType& Instance() {
        static const Type type;
        return type;
    }
};
