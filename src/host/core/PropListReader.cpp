// The property-list reader: pugixml builds the element tree, and a strict walk turns it into a
// PropList, refusing anything the writer would not have produced in a way that could be misread.
#include "host/core/Error.h"
#include "host/core/ErrorTable.h"
#include "host/core/FileUtils.h"
#include "host/core/PropListUtils.h"
#include "host/core/PropListXml.h"
#include "host/core/TextConversion.h"

#include <algorithm>
#include <charconv>
#include <cstring>
#include <pugixml.hpp>

namespace orvcore::proplist {

namespace detail {

// Builds lists from parsed elements. A friend of PropList so it can append pairs in document
// order without a search per pair.
class PropListBuilder {
public:
    explicit PropListBuilder(std::u16string const& sourceName)
        : sourceName_(sourceName) {}

    void ReadList(pugi::xml_node node, PropList& list, int depth) {
        std::size_t children = 0;
        for (pugi::xml_node child = node.first_child(); child; child = child.next_sibling()) {
            ++children;
        }
        list.entries_.reserve(children);
        for (pugi::xml_node child = node.first_child(); child; child = child.next_sibling()) {
            if (SkipLayoutText(child, "a list")) {
                continue;
            }
            if (std::strcmp(child.name(), "prop.pair") != 0) {
                Fail(child,
                     "the element <" + std::string(child.name()) + "> stands where a <prop.pair> belongs");
            }
            ReadPair(child, list, depth);
        }
        Order(node, list);
    }

    [[noreturn]] void Fail(pugi::xml_node at, std::string const& problem) const {
        std::string where = at ? " (at byte " + std::to_string(at.offset_debug()) + ")" : std::string();
        config::ThrowError(config::errors::MalformedPropList, sourceName_, problem + where);
    }

private:
    // True for anything but an element: text between elements, which may only be layout.
    bool SkipLayoutText(pugi::xml_node node, char const* context) const {
        pugi::xml_node_type type = node.type();
        if (type == pugi::node_element) {
            return false;
        }
        if (type == pugi::node_pcdata || type == pugi::node_cdata) {
            for (char const* c = node.value(); *c; ++c) {
                if (*c != ' ' && *c != '\t' && *c != '\r' && *c != '\n') {
                    Fail(node, std::string("unexpected text in ") + context);
                }
            }
        }
        return true;
    }

    void ReadPair(pugi::xml_node pair, PropList& list, int depth) {
        pugi::xml_node keyNode, valueNode;
        for (pugi::xml_node child = pair.first_child(); child; child = child.next_sibling()) {
            if (SkipLayoutText(child, "a pair")) {
                continue;
            }
            if (!keyNode) {
                if (std::strcmp(child.name(), "key") != 0) {
                    Fail(child, "a pair starts with <" + std::string(child.name()) + "> instead of <key>");
                }
                keyNode = child;
            } else if (!valueNode) {
                valueNode = child;
            } else {
                Fail(child, "a pair holds more than a key and one value");
            }
        }
        if (!valueNode) {
            Fail(pair, keyNode ? "a pair has no value" : "a pair has no key");
        }
        std::string key = Text(keyNode);
        PropList::Value value = ReadValue(valueNode, key, depth);
        list.entries_.push_back(PropList::Entry{std::move(key), std::move(value)});
    }

    // Pairs are appended as they come; a list that arrived out of order is sorted once (never one
    // insertion per pair, which a hostile document could make quadratic). A list holds each key
    // once, and keeping either of two values silently could lose the other, so a repeat is an error.
    void Order(pugi::xml_node node, PropList& list) const {
        auto& entries = list.entries_;
        auto byKey = [](PropList::Entry const& a, PropList::Entry const& b) { return a.key < b.key; };
        if (!std::is_sorted(entries.begin(), entries.end(), byKey)) {
            std::sort(entries.begin(), entries.end(), byKey);
        }
        auto repeat = std::adjacent_find(
            entries.begin(), entries.end(),
            [](PropList::Entry const& a, PropList::Entry const& b) { return a.key == b.key; });
        if (repeat != entries.end()) {
            Fail(node, "the key '" + repeat->key + "' occurs twice in one list");
        }
    }

    PropList::Value ReadValue(pugi::xml_node node, std::string const& key, int depth) {
        char const* name = node.name();
        // One comparison per element: the first letter picks the only candidate.
        switch (name[0]) {
        case 'p':
            if (std::strcmp(name, "prop.list") == 0) {
                if (depth + 1 > utils::MaxNestingDepth) {
                    Fail(node, "lists are nested deeper than " + std::to_string(utils::MaxNestingDepth));
                }
                auto sub = std::make_unique<PropList>();
                ReadList(node, *sub, depth + 1);
                return sub;
            }
            break;
        case 'u':
            if (std::strcmp(name, "ustring") == 0) {
                return Text(node);
            }
            break;
        case 's':
            if (std::strcmp(name, "string") == 0) {
                return PropList::Bytes{Text(node)};
            }
            break;
        case 'i':
            if (std::strcmp(name, "int") == 0) {
                return ReadInt(node, key);
            }
            break;
        case 'f':
            if (std::strcmp(name, "float") == 0) {
                return Number<float>(node, key, "float");
            }
            if (std::strcmp(name, "false") == 0) {
                return ReadBool(node, key, false);
            }
            break;
        case 'd':
            if (std::strcmp(name, "double") == 0) {
                return Number<double>(node, key, "double");
            }
            break;
        case 't':
            if (std::strcmp(name, "true") == 0) {
                return ReadBool(node, key, true);
            }
            break;
        case 'a':
            if (std::strcmp(name, "array") == 0) {
                return ReadArray(node, key);
            }
            break;
        default:
            break;
        }
        Fail(node, "the key '" + key + "' has a value of unknown kind <" + std::string(name) + ">");
    }

    PropList::Value ReadBool(pugi::xml_node node, std::string const& key, bool value) {
        if (node.first_child()) {
            Fail(node, "the boolean of key '" + key + "' has content");
        }
        return value;
    }

    PropList::Value ReadInt(pugi::xml_node node, std::string const& key) {
        char const* size = node.attribute("size").as_string("32");
        if (std::strcmp(size, "32") != 0) {
            Fail(node, "the integer of key '" + key + "' has the unsupported size " + size);
        }
        char const* type = node.attribute("type").as_string("signed");
        if (std::strcmp(type, "signed") == 0) {
            return Number<std::int32_t>(node, key, "signed 32-bit integer");
        }
        if (std::strcmp(type, "unsigned") == 0) {
            return Number<std::uint32_t>(node, key, "unsigned 32-bit integer");
        }
        Fail(node, "the integer of key '" + key + "' has the unknown type '" + type + "'");
    }

    PropList::Value ReadArray(pugi::xml_node node, std::string const& key) {
        std::string type = node.attribute("type").as_string();
        bool ints = type == "int32";
        if (!ints && type != "utf8" && type != "utf16") {
            Fail(node, "the list of key '" + key + "' has the unknown type '" + type + "'");
        }
        bool wide = type == "utf16";
        std::vector<std::string> texts;
        std::vector<std::u16string> wideTexts;
        std::vector<std::int32_t> numbers;
        char const* itemName = ints ? "int" : "ustring";
        for (pugi::xml_node item = node.first_child(); item; item = item.next_sibling()) {
            if (SkipLayoutText(item, "a list value")) {
                continue;
            }
            if (std::strcmp(item.name(), itemName) != 0) {
                Fail(item, "the list of key '" + key + "' holds <" + std::string(item.name()) +
                               "> instead of <" + itemName + ">");
            }
            if (ints) {
                numbers.push_back(Number<std::int32_t>(item, key, "signed 32-bit integer"));
            } else if (wide) {
                wideTexts.push_back(utility::UTF8to16(Text(item)));
            } else {
                texts.push_back(Text(item));
            }
        }
        if (ints) {
            return numbers;
        }
        if (wide) {
            return wideTexts;
        }
        return texts;
    }

    // The unescaped text content of an element that must hold only text.
    std::string Text(pugi::xml_node node) const {
        std::string out;
        for (pugi::xml_node child = node.first_child(); child; child = child.next_sibling()) {
            pugi::xml_node_type type = child.type();
            if (type == pugi::node_pcdata) {
                std::string problem;
                if (!Unescape(child.value(), out, problem)) {
                    Fail(child, "the text holds " + problem);
                }
            } else if (type == pugi::node_cdata) {
                out += child.value();
            } else if (type == pugi::node_element) {
                Fail(child, "the element <" + std::string(child.name()) + "> stands inside <" + node.name() +
                                ">, which holds only text");
            }
        }
        return out;
    }

    template <typename T> T Number(pugi::xml_node node, std::string const& key, char const* what) const {
        std::string text = Text(node);
        std::size_t begin = text.find_first_not_of(" \t\r\n");
        std::size_t end = text.find_last_not_of(" \t\r\n");
        T value{};
        bool ok = begin != std::string::npos;
        if (ok) {
            char const* first = text.data() + begin;
            char const* last = text.data() + end + 1;
            std::from_chars_result result;
            if constexpr (std::is_floating_point_v<T>) {
                result = std::from_chars(first, last, value, std::chars_format::general);
            } else {
                result = std::from_chars(first, last, value);
            }
            ok = result.ec == std::errc() && result.ptr == last;
        }
        if (!ok) {
            Fail(node, "'" + text + "' is not a valid " + what + " (key '" + key + "')");
        }
        return value;
    }

    std::u16string const& sourceName_;
};

} // namespace detail

namespace utils {

namespace {

// Element text is kept raw (escapes are decoded by our own rules, which also keep NUL), line ends
// are normalised as XML asks, and a whitespace-only text is kept when it is an element's only
// content, so a value of spaces reads back as spaces.
constexpr unsigned ParseOptions = pugi::parse_cdata | pugi::parse_eol | pugi::parse_ws_pcdata_single;

pugi::xml_node SingleRootElement(pugi::xml_document const& doc, detail::PropListBuilder const& builder) {
    pugi::xml_node root;
    for (pugi::xml_node child : doc.children()) {
        if (child.type() == pugi::node_element) {
            if (root) {
                builder.Fail(child, "the document has more than one root element");
            }
            root = child;
        } else if (child.type() == pugi::node_pcdata || child.type() == pugi::node_cdata) {
            builder.Fail(child, "the document has text outside its root element");
        }
    }
    if (!root) {
        builder.Fail(pugi::xml_node(), "the document has no root element");
    }
    return root;
}

// The one prop.list element inside prop.map.
pugi::xml_node ListOfMap(pugi::xml_node map, detail::PropListBuilder const& builder) {
    pugi::xml_attribute version = map.attribute("version");
    if (version && std::strcmp(version.value(), detail::MapVersion) != 0) {
        builder.Fail(map, "the document's version '" + std::string(version.value()) + "' is not supported");
    }
    pugi::xml_node list;
    for (pugi::xml_node child : map.children()) {
        if (child.type() != pugi::node_element) {
            continue;
        }
        if (list || std::strcmp(child.name(), "prop.list") != 0) {
            builder.Fail(child, "<prop.map> must hold exactly one <prop.list>");
        }
        list = child;
    }
    if (!list) {
        builder.Fail(map, "<prop.map> holds no <prop.list>");
    }
    return list;
}

// Parses buffer (modified in place) into list. A fragment may be a bare prop.list; a document must
// be a prop.map.
void Parse(std::string& buffer, PropList& list, std::u16string const& sourceName, bool requireDocument) {
    detail::PropListBuilder builder(sourceName);
    pugi::xml_document doc;
    pugi::xml_parse_result parsed =
        doc.load_buffer_inplace(buffer.data(), buffer.size(), ParseOptions, pugi::encoding_utf8);
    if (!parsed) {
        config::ThrowError(config::errors::MalformedPropList, sourceName,
                           std::string(parsed.description()) + " (at byte " + std::to_string(parsed.offset) +
                               ")");
    }
    pugi::xml_node root = SingleRootElement(doc, builder);
    pugi::xml_node listNode;
    if (std::strcmp(root.name(), "prop.map") == 0) {
        listNode = ListOfMap(root, builder);
    } else if (!requireDocument && std::strcmp(root.name(), "prop.list") == 0) {
        listNode = root;
    } else {
        builder.Fail(root, "the root element is <" + std::string(root.name()) + ">, not " +
                               (requireDocument ? "<prop.map>" : "<prop.map> or <prop.list>"));
    }
    PropList result;
    builder.ReadList(listNode, result, 1);
    list.Swap(result);
}

} // namespace

void ReadPropList(std::string const& text, PropList& list) {
    std::string buffer = text;
    Parse(buffer, list, u"fragment", false);
}

void ParseDocument(std::string text, PropList& list, std::u16string const& sourceName) {
    Parse(text, list, sourceName, true);
}

std::string DocumentText(PropList const& list) {
    std::string out = detail::DocumentHead;
    list.OutputAsXMLFragment(out);
    out += detail::DocumentTail;
    return out;
}

void SavePropList(std::u16string const& path, PropList const& list) {
    utility::FileUtils::WriteFileAtomically(path, DocumentText(list));
}

bool LoadPropList(std::u16string const& path, PropList& list, bool raiseErrors) {
    try {
        ParseDocument(utility::FileUtils::ReadWholeFile(path, MaxDocumentBytes), list, path);
        return true;
    } catch (config::Error const&) {
        if (raiseErrors) {
            throw;
        }
        return false;
    }
}

} // namespace utils

} // namespace orvcore::proplist
