// The key/value tree that carries every document of the library: saved workspaces, the manager's
// settings, panels' own state. Keys are UTF-8 byte strings held in byte order, once per list; values
// are nested lists, texts, numbers, booleans and lists of texts or integers. A list owns its
// sub-lists. The XML form is written by OutputAsXMLFragment and read by the functions of
// PropListUtils.h.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <variant>
#include <vector>

namespace orvcore::proplist {

namespace detail {
class PropListBuilder;
}

class PropList {
public:
    // The kinds of value a pair can hold, one per XML value element.
    enum class Kind {
        SubList,
        String,     // UTF-8 text; UTF-16 texts are stored as this kind too
        ByteString, // bytes that need not be UTF-8
        Int32,
        UInt32,
        Float,
        Double,
        Bool,
        String16List, // list of UTF-16 texts
        StringList,   // list of UTF-8 texts
        Int32List,
    };

    PropList();
    virtual ~PropList();
    // Copies are deep: sub-lists are copied, never shared.
    PropList(PropList const& other);
    PropList& operator=(PropList const& other);
    PropList(PropList&& other) noexcept;
    PropList& operator=(PropList&& other) noexcept;

    // Each GetValue returns whether a value of a matching kind is under the key, and only then
    // writes out; on false the caller's default stays. Integers of the other signedness match when
    // their value fits, floats and doubles match each other, UTF-8 and byte strings match a text,
    // and the two kinds of string list match each other. A double beyond the float range does not
    // match a float.
    virtual bool GetValue(std::string const& key, std::string& out) const;
    virtual bool GetValue(std::string const& key, std::u16string& out) const;
    virtual bool GetValue(std::string const& key, bool& out) const;
    virtual bool GetValue(std::string const& key, std::int32_t& out) const;
    virtual bool GetValue(std::string const& key, std::uint32_t& out) const;
    virtual bool GetValue(std::string const& key, float& out) const;
    virtual bool GetValue(std::string const& key, double& out) const;
    virtual bool GetValue(std::string const& key, std::vector<std::int32_t>& out) const;
    virtual bool GetValue(std::string const& key, std::vector<std::string>& out) const;
    virtual bool GetValue(std::string const& key, std::vector<std::u16string>& out) const;
    bool GetByteString(std::string const& key, std::string& out) const;

    // Each SetValue inserts the pair or replaces the value under the key, whatever its kind was.
    virtual void SetValue(std::string const& key, std::string const& value);
    virtual void SetValue(std::string const& key, std::u16string const& value);
    virtual void SetValue(std::string const& key, bool value);
    virtual void SetValue(std::string const& key, std::int32_t value);
    virtual void SetValue(std::string const& key, std::uint32_t value);
    virtual void SetValue(std::string const& key, float value);
    virtual void SetValue(std::string const& key, double value);
    virtual void SetValue(std::string const& key, std::vector<std::int32_t> const& value);
    virtual void SetValue(std::string const& key, std::vector<std::string> const& value);
    virtual void SetValue(std::string const& key, std::vector<std::u16string> const& value);
    // Literal texts are texts, not booleans.
    void SetValue(std::string const& key, char const* value) {
        SetValue(key, std::string(value ? value : ""));
    }
    void SetValue(std::string const& key, char16_t const* value) {
        SetValue(key, std::u16string(value ? value : u""));
    }
    // Any other pointer would silently become a boolean.
    template <typename T> void SetValue(std::string const& key, T const* value) = delete;
    void SetByteString(std::string const& key, std::string const& bytes);

    // The sub-list under the key, or null when there is none or the value is of another kind.
    PropList* GetSubList(std::string const& key);
    PropList const* GetSubList(std::string const& key) const;
    // Puts a new empty sub-list under the key, replacing any value there, and returns it. The
    // returned list is owned by this one and lives until its pair is replaced or removed.
    PropList* NewSubList(std::string const& key);

    // The stored value itself when the key holds exactly a T (a list of texts, say), else null: a
    // reader of a long list spares copying it. Valid until the pair is changed.
    template <typename T> T const* Peek(std::string const& key) const {
        Value const* v = Find(key);
        return v ? std::get_if<T>(v) : nullptr;
    }

    // Removes the pair; false when there was none.
    bool RemoveValue(std::string const& key);
    bool IsEmpty() const { return entries_.empty(); }
    std::size_t Size() const { return entries_.size(); }
    void Clear() { entries_.clear(); }
    bool HasKey(std::string const& key) const { return Find(key) != nullptr; }
    // The kind of the value under the key, nothing when absent.
    std::optional<Kind> KindOf(std::string const& key) const;
    // The keys in their order.
    std::vector<std::string> Keys() const;
    void Swap(PropList& other) noexcept { entries_.swap(other.entries_); }

    // Appends the XML of this list (one prop.list element with its pairs, every line ending in
    // CR LF) to out.
    void OutputAsXMLFragment(std::string& out) const;

    // Deep equality: same keys, same kinds, same values.
    bool operator==(PropList const& other) const;
    bool operator!=(PropList const& other) const { return !(*this == other); }

private:
    friend class detail::PropListBuilder;

    struct Bytes {
        std::string bytes;
        bool operator==(Bytes const& o) const { return bytes == o.bytes; }
    };
    // The alternatives are in the order of Kind.
    using Value = std::variant<std::unique_ptr<PropList>, std::string, Bytes, std::int32_t, std::uint32_t,
                               float, double, bool, std::vector<std::u16string>, std::vector<std::string>,
                               std::vector<std::int32_t>>;
    struct Entry {
        std::string key;
        Value value;
    };

    Value const* Find(std::string const& key) const;
    // The value under the key, inserted (holding a null sub-list) when absent.
    Value& Slot(std::string const& key);
    static void WriteValue(Value const& value, std::string& out);

    // Sorted by key, byte by byte. A sorted vector rather than a map: documents are read in key
    // order, so building one is a run of appends, and lookups stay cache-friendly.
    std::vector<Entry> entries_;
};

} // namespace orvcore::proplist
