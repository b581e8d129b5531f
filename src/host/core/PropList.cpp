// The property list's data model and its XML writer.
#include "host/core/PropList.h"

#include "host/core/PropListXml.h"
#include "host/core/TextConversion.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>

namespace orvcore::proplist {

namespace {

// Shortest decimal text with at most six significant digits, independent of the C locale.
template <typename F> void AppendReal(F value, std::string& out) {
    char buffer[32];
    auto result = std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::general, 6);
    out.append(buffer, result.ptr);
}

template <typename I> void AppendInteger(I value, std::string& out) {
    char buffer[16];
    auto result = std::to_chars(buffer, buffer + sizeof buffer, value);
    out.append(buffer, result.ptr);
}

void AppendTextElement(char const* open, char const* close, std::string_view text, std::string& out) {
    out += open;
    detail::AppendEscaped(text, out);
    out += close;
    out += detail::LineEnd;
}

void AppendSignedInt(std::int32_t value, std::string& out) {
    out += "<int type='signed' size='32'>";
    AppendInteger(value, out);
    out += "</int>\r\n";
}

} // namespace

PropList::PropList() = default;
PropList::~PropList() = default;
PropList::PropList(PropList&& other) noexcept = default;
PropList& PropList::operator=(PropList&& other) noexcept = default;

PropList::PropList(PropList const& other) {
    entries_.reserve(other.entries_.size());
    for (Entry const& e : other.entries_) {
        if (auto const* sub = std::get_if<std::unique_ptr<PropList>>(&e.value)) {
            entries_.push_back(Entry{e.key, std::make_unique<PropList>(**sub)});
        } else {
            entries_.push_back(Entry{e.key, Value()});
            // Every other alternative is a plain value type and copies as itself.
            std::visit(
                [&](auto const& v) {
                    using V = std::decay_t<decltype(v)>;
                    if constexpr (!std::is_same_v<V, std::unique_ptr<PropList>>) {
                        entries_.back().value = v;
                    }
                },
                e.value);
        }
    }
}

PropList& PropList::operator=(PropList const& other) {
    if (this != &other) {
        PropList copy(other);
        Swap(copy);
    }
    return *this;
}

PropList::Value const* PropList::Find(std::string const& key) const {
    auto it = std::lower_bound(entries_.begin(), entries_.end(), key,
                               [](Entry const& e, std::string const& k) { return e.key < k; });
    return it != entries_.end() && it->key == key ? &it->value : nullptr;
}

PropList::Value& PropList::Slot(std::string const& key) {
    // Documents arrive in key order, so appending is the common case.
    if (entries_.empty() || entries_.back().key < key) {
        entries_.push_back(Entry{key, Value()});
        return entries_.back().value;
    }
    auto it = std::lower_bound(entries_.begin(), entries_.end(), key,
                               [](Entry const& e, std::string const& k) { return e.key < k; });
    if (it == entries_.end() || it->key != key) {
        it = entries_.insert(it, Entry{key, Value()});
    }
    return it->value;
}

bool PropList::GetValue(std::string const& key, std::string& out) const {
    Value const* v = Find(key);
    if (!v) {
        return false;
    }
    if (auto const* s = std::get_if<std::string>(v)) {
        out = *s;
        return true;
    }
    if (auto const* b = std::get_if<Bytes>(v)) {
        out = b->bytes;
        return true;
    }
    return false;
}

bool PropList::GetValue(std::string const& key, std::u16string& out) const {
    std::string text;
    if (!GetValue(key, text)) {
        return false;
    }
    out = utility::UTF8to16(text);
    return true;
}

bool PropList::GetByteString(std::string const& key, std::string& out) const {
    return GetValue(key, out);
}

bool PropList::GetValue(std::string const& key, bool& out) const {
    Value const* v = Find(key);
    if (auto const* b = v ? std::get_if<bool>(v) : nullptr) {
        out = *b;
        return true;
    }
    return false;
}

bool PropList::GetValue(std::string const& key, std::int32_t& out) const {
    Value const* v = Find(key);
    if (!v) {
        return false;
    }
    if (auto const* i = std::get_if<std::int32_t>(v)) {
        out = *i;
        return true;
    }
    if (auto const* u = std::get_if<std::uint32_t>(v);
        u && *u <= static_cast<std::uint32_t>(std::numeric_limits<std::int32_t>::max())) {
        out = static_cast<std::int32_t>(*u);
        return true;
    }
    return false;
}

bool PropList::GetValue(std::string const& key, std::uint32_t& out) const {
    Value const* v = Find(key);
    if (!v) {
        return false;
    }
    if (auto const* u = std::get_if<std::uint32_t>(v)) {
        out = *u;
        return true;
    }
    if (auto const* i = std::get_if<std::int32_t>(v); i && *i >= 0) {
        out = static_cast<std::uint32_t>(*i);
        return true;
    }
    return false;
}

bool PropList::GetValue(std::string const& key, float& out) const {
    double d = 0;
    if (!GetValue(key, d)) {
        return false;
    }
    // A finite double beyond the float range has no float value; converting it is undefined.
    if (std::isfinite(d) && std::fabs(d) > std::numeric_limits<float>::max()) {
        return false;
    }
    out = static_cast<float>(d);
    return true;
}

bool PropList::GetValue(std::string const& key, double& out) const {
    Value const* v = Find(key);
    if (!v) {
        return false;
    }
    if (auto const* d = std::get_if<double>(v)) {
        out = *d;
        return true;
    }
    if (auto const* f = std::get_if<float>(v)) {
        out = *f;
        return true;
    }
    return false;
}

bool PropList::GetValue(std::string const& key, std::vector<std::int32_t>& out) const {
    Value const* v = Find(key);
    if (auto const* list = v ? std::get_if<std::vector<std::int32_t>>(v) : nullptr) {
        out = *list;
        return true;
    }
    return false;
}

bool PropList::GetValue(std::string const& key, std::vector<std::string>& out) const {
    Value const* v = Find(key);
    if (!v) {
        return false;
    }
    if (auto const* list = std::get_if<std::vector<std::string>>(v)) {
        out = *list;
        return true;
    }
    if (auto const* wide = std::get_if<std::vector<std::u16string>>(v)) {
        out.clear();
        for (std::u16string const& s : *wide) {
            out.push_back(utility::UTF16to8(s));
        }
        return true;
    }
    return false;
}

bool PropList::GetValue(std::string const& key, std::vector<std::u16string>& out) const {
    Value const* v = Find(key);
    if (!v) {
        return false;
    }
    if (auto const* wide = std::get_if<std::vector<std::u16string>>(v)) {
        out = *wide;
        return true;
    }
    if (auto const* list = std::get_if<std::vector<std::string>>(v)) {
        out.clear();
        for (std::string const& s : *list) {
            out.push_back(utility::UTF8to16(s));
        }
        return true;
    }
    return false;
}

void PropList::SetValue(std::string const& key, std::string const& value) {
    Slot(key) = value;
}
void PropList::SetValue(std::string const& key, std::u16string const& value) {
    Slot(key) = utility::UTF16to8(value);
}
void PropList::SetValue(std::string const& key, bool value) {
    Slot(key) = value;
}
void PropList::SetValue(std::string const& key, std::int32_t value) {
    Slot(key) = value;
}
void PropList::SetValue(std::string const& key, std::uint32_t value) {
    Slot(key) = value;
}
void PropList::SetValue(std::string const& key, float value) {
    Slot(key) = value;
}
void PropList::SetValue(std::string const& key, double value) {
    Slot(key) = value;
}
void PropList::SetValue(std::string const& key, std::vector<std::int32_t> const& value) {
    Slot(key) = value;
}
void PropList::SetValue(std::string const& key, std::vector<std::string> const& value) {
    Slot(key) = value;
}
void PropList::SetValue(std::string const& key, std::vector<std::u16string> const& value) {
    Slot(key) = value;
}
void PropList::SetByteString(std::string const& key, std::string const& bytes) {
    Slot(key) = Bytes{bytes};
}

PropList* PropList::GetSubList(std::string const& key) {
    return const_cast<PropList*>(static_cast<PropList const*>(this)->GetSubList(key));
}

PropList const* PropList::GetSubList(std::string const& key) const {
    Value const* v = Find(key);
    auto const* sub = v ? std::get_if<std::unique_ptr<PropList>>(v) : nullptr;
    return sub ? sub->get() : nullptr;
}

PropList* PropList::NewSubList(std::string const& key) {
    auto sub = std::make_unique<PropList>();
    PropList* result = sub.get();
    Slot(key) = std::move(sub);
    return result;
}

bool PropList::RemoveValue(std::string const& key) {
    auto it = std::lower_bound(entries_.begin(), entries_.end(), key,
                               [](Entry const& e, std::string const& k) { return e.key < k; });
    if (it == entries_.end() || it->key != key) {
        return false;
    }
    entries_.erase(it);
    return true;
}

std::optional<PropList::Kind> PropList::KindOf(std::string const& key) const {
    Value const* v = Find(key);
    if (!v) {
        return std::nullopt;
    }
    return static_cast<Kind>(v->index());
}

std::vector<std::string> PropList::Keys() const {
    std::vector<std::string> keys;
    keys.reserve(entries_.size());
    for (Entry const& e : entries_) {
        keys.push_back(e.key);
    }
    return keys;
}

bool PropList::operator==(PropList const& other) const {
    if (entries_.size() != other.entries_.size()) {
        return false;
    }
    for (std::size_t i = 0; i < entries_.size(); ++i) {
        Entry const& a = entries_[i];
        Entry const& b = other.entries_[i];
        if (a.key != b.key || a.value.index() != b.value.index()) {
            return false;
        }
        auto const* subA = std::get_if<std::unique_ptr<PropList>>(&a.value);
        if (subA) {
            auto const& subB = std::get<std::unique_ptr<PropList>>(b.value);
            // A null sub-list only exists transiently inside Slot; treat two of them as equal.
            if ((*subA == nullptr) != (subB == nullptr) || (*subA && !(**subA == *subB))) {
                return false;
            }
        } else if (!(a.value == b.value)) {
            return false;
        }
    }
    return true;
}

void PropList::OutputAsXMLFragment(std::string& out) const {
    out += "<prop.list>\r\n";
    for (Entry const& e : entries_) {
        out += "<prop.pair>\r\n";
        AppendTextElement("<key>", "</key>", e.key, out);
        WriteValue(e.value, out);
        out += "</prop.pair>\r\n";
    }
    out += "</prop.list>\r\n";
}

void PropList::WriteValue(Value const& value, std::string& out) {
    switch (static_cast<Kind>(value.index())) {
    case Kind::SubList:
        if (auto const& sub = std::get<std::unique_ptr<PropList>>(value)) {
            sub->OutputAsXMLFragment(out);
        } else {
            PropList().OutputAsXMLFragment(out);
        }
        break;
    case Kind::String:
        AppendTextElement("<ustring>", "</ustring>", std::get<std::string>(value), out);
        break;
    case Kind::ByteString:
        AppendTextElement("<string>", "</string>", std::get<Bytes>(value).bytes, out);
        break;
    case Kind::Int32:
        AppendSignedInt(std::get<std::int32_t>(value), out);
        break;
    case Kind::UInt32:
        out += "<int type='unsigned' size='32'>";
        AppendInteger(std::get<std::uint32_t>(value), out);
        out += "</int>\r\n";
        break;
    case Kind::Float:
        out += "<float>";
        AppendReal(std::get<float>(value), out);
        out += "</float>\r\n";
        break;
    case Kind::Double:
        out += "<double>";
        AppendReal(std::get<double>(value), out);
        out += "</double>\r\n";
        break;
    case Kind::Bool:
        out += std::get<bool>(value) ? "<true/>\r\n" : "<false/>\r\n";
        break;
    case Kind::String16List:
        out += "<array type='utf16'>\r\n";
        for (std::u16string const& s : std::get<std::vector<std::u16string>>(value)) {
            AppendTextElement("<ustring>", "</ustring>", utility::UTF16to8(s), out);
        }
        out += "</array>\r\n";
        break;
    case Kind::StringList:
        out += "<array type='utf8'>\r\n";
        for (std::string const& s : std::get<std::vector<std::string>>(value)) {
            AppendTextElement("<ustring>", "</ustring>", s, out);
        }
        out += "</array>\r\n";
        break;
    case Kind::Int32List:
        out += "<array type='int32'>\r\n";
        for (std::int32_t i : std::get<std::vector<std::int32_t>>(value)) {
            AppendSignedInt(i, out);
        }
        out += "</array>\r\n";
        break;
    }
}

} // namespace orvcore::proplist
