#ifndef QRX_FOUNDATION_COW_MAP_H
#define QRX_FOUNDATION_COW_MAP_H

#include "foundation/cow_COW.h"
#include "foundation/cow_Range.h"
#include "foundation/cow_String.h"

#include <memory>
#include <unordered_map>
#include <vector>

/// Raises the failure of a key that a container doesn't hold.
[[noreturn]] void cow_RaiseNoSuchKey(const char* container, const cow_String& key);
inline void cow_RaiseNoSuchKey(const char* container, int key) {
    cow_RaiseNoSuchKey(container, cow_String(key));
}

template <class K, class V>
class cow_MapNode;

template <class K, class V>
using cow_MapNodeHandle = cow_COW<cow_MapNode<K, V>, cow_Direct<cow_MapNode<K, V>>>;

template <class K, class V>
class cow_MapNode : public mem_AllocationOperators {
public:
    cow_MapNode(const K& nodeKey, const V& nodeValue) : key(nodeKey), value(nodeValue) {}
    cow_MapNode(const cow_MapNode&) = default;
    cow_MapNode& operator=(const cow_MapNode&) = delete;
    ~cow_MapNode() {
        Drop(left);
        Drop(right);
    }

    K key;
    V value;
    cow_MapNodeHandle<K, V> left;
    cow_MapNodeHandle<K, V> right;

private:
    // Drops a subtree without recursion, since equal bits make long chains: turns left children up to the
    // top until the top has none of its own, then lets the top go.
    static void Drop(cow_MapNodeHandle<K, V>& subtree) noexcept {
        cow_MapNodeHandle<K, V> top(std::move(subtree));
        while (top.HolderCount() == 1) {
            if (top->left.HolderCount() == 1) {
                cow_MapNodeHandle<K, V> child(std::move(top->left));
                top->left = std::move(child->right);
                child->right = std::move(top);
                top = std::move(child);
            } else {
                cow_MapNodeHandle<K, V> rest(std::move(top->right));
                top = std::move(rest);
            }
        }
    }
};

/// The path of a text key: at even depth the lowest bit of a byte counted from the key's head (the
/// terminating zero byte included), at odd depth that of a byte counted from its tail, beyond the key 0.
/// The walk order of every map, and with it the order of some deck lines, rests on this rule.
inline bool cow_MapGoesRight(const cow_String& key, int depth) {
    const int length = key.Length();
    if (depth > length) return false;
    const int place = (depth & 1) != 0 ? length - (depth >> 1) - 1 : depth >> 1;
    return (static_cast<unsigned char>(key.CStr()[place]) & 1U) != 0;
}

/// Integer keys go by their bits, the lowest first; no deck order depends on it.
inline bool cow_MapGoesRight(int key, int depth) {
    return depth < 32 && ((static_cast<unsigned>(key) >> depth) & 1U) != 0;
}

/// What a map's index of its keys is made of; the view lives as long as the key's storage.
inline std::string_view cow_MapIndexKey(const cow_String& key) {
    return key.View();
}
inline int cow_MapIndexKey(int key) {
    return key;
}

/// A digital search tree, NOT a sorted map: it is walked in pre-order (node, left, right), which depends on
/// the order of insertion and on single bits of the keys. Copies share all subtrees until one is written.
/// Keys that agree in the bits that count make long chains, so a large map also keeps an index of its nodes.
template <class K, class V>
class cow_Map {
public:
    cow_Map() = default;
    // Moving would leave the count behind without nodes; a copy costs no more.
    cow_Map(const cow_Map& other) : root_(other.root_), count_(other.count_), shared_(true) {
        other.shared_ = true;
    }
    cow_Map& operator=(const cow_Map& other) {
        if (this == &other) return *this;
        DropIndex();
        root_ = other.root_;
        count_ = other.count_;
        shared_ = true;
        other.shared_ = true;
        return *this;
    }
    ~cow_Map() = default;

    /// Adds the pair, or overwrites the value of an existing key, which keeps its place. Always true.
    bool Insert(const K& key, const V& value) {
        if (Node* node = PrivateNode(key)) {
            node->value = value;
        } else {
            Hang(key, value);
        }
        return true;
    }
    bool IsMember(const K& key) const { return FindNode(key) != nullptr; }
    /// The value; an absent key raises "cow_Map: no entry ...".
    const V& ConstGet(const K& key) const {
        const Node* node = FindNode(key);
        if (node == nullptr) cow_RaiseNoSuchKey("cow_Map", key);
        return node->value;
    }
    /// The value for writing; an absent key raises as in ConstGet.
    V& Get(const K& key) {
        Node* node = PrivateNode(key);
        if (node == nullptr) cow_RaiseNoSuchKey("cow_Map", key);
        return node->value;
    }
    /// The value for writing, a default one at the key's first use.
    V& GetOrInsert(const K& key) {
        if (Node* node = PrivateNode(key)) return node->value;
        return Hang(key, V())->value;
    }
    /// The value, or null for an absent key.
    const V* Find(const K& key) const {
        const Node* node = FindNode(key);
        return node == nullptr ? nullptr : &node->value;
    }
    class ConstIterator;
    /// The entries in the order of the walk, for loops that leave the map as it is.
    ConstIterator begin() const { return ConstIterator(root_); }
    ConstIterator end() const { return {}; }

    /// True if the key was there. All other keys stay reachable; the walk order of those below the removed
    /// node may change.
    bool Remove(const K& key) {
        if (!IsMember(key)) return false;
        DropIndex();
        Handle* place = PrivatePlace(key);
        // Any leaf below may stand in the removed node's place: its path leads through it.
        Handle* leaf = place;
        for (;;) {
            Node& node = leaf->Get();
            if (!node.left.IsNull()) {
                leaf = &node.left;
            } else if (!node.right.IsNull()) {
                leaf = &node.right;
            } else {
                break;
            }
        }
        Node& top = place->Get();
        if (leaf != place) {
            std::swap(top.key, leaf->Referent()->key);
            std::swap(top.value, leaf->Referent()->value);
        }
        leaf->Reset(nullptr);
        --count_;
        return true;
    }
    int Count() const { return count_; }

private:
    template <class, class>
    friend class cow_ConstMapIterator;
    using Node = cow_MapNode<K, V>;
    using Handle = cow_MapNodeHandle<K, V>;

    using IndexKey = decltype(cow_MapIndexKey(std::declval<const K&>()));
    using Index = std::unordered_map<IndexKey, Node*>;
    static constexpr int kSmallestIndexed = 64;
    // An index pays when it saves about this many walks a key.
    static constexpr int kWalksPerIndex = 8;

    const Node* FindNode(const K& key) const {
        if (const Index* index = count_ < kSmallestIndexed ? nullptr : FindIndex()) {
            const auto place = index->find(cow_MapIndexKey(key));
            return place == index->end() ? nullptr : place->second;
        }
        const Node* node = root_.Referent();
        for (int depth = 0; node != nullptr && !(node->key == key); ++depth) {
            node = (cow_MapGoesRight(key, depth) ? node->right : node->left).Referent();
        }
        return node;
    }

    // The index, made when it begins to pay; null before that.
    const Index* FindIndex() const {
        if (const Index* index = index_.Get()) return index;
        walks_ = walks_ + 1;
        if (walks_ < count_ / kWalksPerIndex) return nullptr;
        auto index = std::make_unique<Index>();
        std::vector<Node*> open{root_.Referent()};
        while (!open.empty()) {
            Node* node = open.back();
            open.pop_back();
            index->emplace(cow_MapIndexKey(node->key), node);
            if (!node->right.IsNull()) open.push_back(node->right.Referent());
            if (!node->left.IsNull()) open.push_back(node->left.Referent());
        }
        return index_.Keep(std::move(index));
    }

    void DropIndex() {
        index_.Drop();
        walks_ = 0;
    }

    // The key's node as this map's own, or null for an absent key. Its path is made private only where
    // another map may share it.
    Node* PrivateNode(const K& key) {
        const Node* node = FindNode(key);
        if (node == nullptr) return nullptr;
        return shared_ ? PrivatePlace(key)->Referent() : const_cast<Node*>(node);
    }

    Node* Hang(const K& key, const V& value) {
        Handle* place = PrivatePlace(key);
        place->Reset(new Node(key, value));
        ++count_;
        Node* node = place->Referent();
        try {
            if (Index* index = index_.Get()) index->emplace(cow_MapIndexKey(node->key), node);
        } catch (...) {
            // The tree is whole; an index that misses a key is worse than none.
            DropIndex();
        }
        return node;
    }

    // The handle where the key's node is or would hang; every node on the way is this map's own.
    Handle* PrivatePlace(const K& key) {
        Handle* place = &root_;
        for (int depth = 0; !place->IsNull(); ++depth) {
            // The index knows the node that a copy takes the place of.
            if (place->HolderCount() > 1) DropIndex();
            Node& node = place->Get();
            if (node.key == key) break;
            place = cow_MapGoesRight(key, depth) ? &node.right : &node.left;
        }
        return place;
    }

    Handle root_;
    int count_ = 0;
    // Whether another map may share nodes. Never becomes false again.
    mutable thr_Relaxed<bool> shared_ = false;
    mutable thr_Relaxed<int> walks_ = 0;
    thr_Kept<Index> index_;
};

template <class K, class V>
class cow_Map<K, V>::ConstIterator {
public:
    using iterator_category = std::input_iterator_tag;
    using difference_type = std::ptrdiff_t;
    using reference = cow_Entry<K, const V&>;
    using value_type = reference;
    using pointer = void;

    ConstIterator() = default;
    explicit ConstIterator(const Handle& root) { Push(root); }
    reference operator*() const { return {open_.back()->key, open_.back()->value}; }
    ConstIterator& operator++() {
        const Node* node = open_.back();
        open_.pop_back();
        Push(node->right);
        Push(node->left);
        return *this;
    }
    ConstIterator operator++(int) {
        ConstIterator before(*this);
        ++*this;
        return before;
    }
    friend bool operator==(const ConstIterator& a, const ConstIterator& b) { return a.open_ == b.open_; }

private:
    void Push(const Handle& subtree) {
        if (!subtree.IsNull()) open_.push_back(subtree.Referent());
    }

    std::vector<const Node*> open_; // the entry that it stands at comes last, those to be visited before it
};

/// A snapshot of a map's walk in pre-order. The map must not be changed while it is in use.
template <class K, class V>
class cow_ConstMapIterator {
public:
    explicit cow_ConstMapIterator(const cow_Map<K, V>& map) : map_(map) { First(); }

    void First() {
        nodes_.clear();
        nodes_.reserve(static_cast<std::size_t>(map_.count_) + 1);
        // Not recursive: equal bits make long chains.
        std::vector<const Node*> open;
        if (!map_.root_.IsNull()) open.push_back(map_.root_.Referent());
        while (!open.empty()) {
            const Node* node = open.back();
            open.pop_back();
            nodes_.push_back(node);
            if (!node->right.IsNull()) open.push_back(node->right.Referent());
            if (!node->left.IsNull()) open.push_back(node->left.Referent());
        }
        nodes_.push_back(nullptr);
        position_ = 0;
    }
    void Next() { ++position_; }
    bool IsDone() const { return nodes_[position_] == nullptr; }
    const K& CurrentKey() const { return nodes_[position_]->key; }
    const V& CurrentValue() const { return nodes_[position_]->value; }

private:
    using Node = cow_MapNode<K, V>;

    const cow_Map<K, V>& map_;
    std::vector<const Node*> nodes_;
    std::size_t position_ = 0;
};

#endif
