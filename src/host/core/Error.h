// The one exception type of the library and the function that raises it. An error carries the
// localisation key of its message, its facility and code (see ErrorTable.h), and the message
// already localised and filled in, so a catcher can show it or match it without more lookups.
#pragma once

#include <exception>
#include <string>

namespace orvcore::config {

struct ErrorEntry;

// One of the four values an error message's placeholders "@0".."@3" are filled with.
class ReplacementValue {
public:
    ReplacementValue() = default;
    ReplacementValue(std::u16string text)
        : text_(std::move(text)) {}
    ReplacementValue(std::string const& utf8);
    ReplacementValue(char const* utf8);
    ReplacementValue(long long number);

    std::u16string const& Text() const { return text_; }
    bool IsEmpty() const { return text_.empty(); }

private:
    std::u16string text_;
};

class Error : public std::exception {
public:
    Error(int level, std::string key, int facility, int code, bool report, std::u16string message);

    int Level() const { return level_; }
    // The localisation key as it was raised, default text included ("$$$/...=Text").
    std::string const& Key() const { return key_; }
    int Facility() const { return facility_; }
    int Code() const { return code_; }
    // Whether the raiser asked for the error to be shown to the user.
    bool ShouldReport() const { return report_; }
    // The localised message with its placeholders filled.
    std::u16string const& Message() const { return message_; }
    // The table entry of this error's facility and code, or null for a code outside the table.
    ErrorEntry const* Entry() const;

    // The message in UTF-8.
    char const* what() const noexcept override { return what_.c_str(); }

private:
    int level_;
    std::string key_;
    int facility_;
    int code_;
    bool report_;
    std::u16string message_;
    std::string what_;
};

// Raises an Error; never returns. The message is the key localised, with "@0".."@3" replaced by
// r1..r4.
[[noreturn]] void ThrowError(int level, std::string const& key, int facility, int code, bool report,
                             ReplacementValue const& r1 = {}, ReplacementValue const& r2 = {},
                             ReplacementValue const& r3 = {}, ReplacementValue const& r4 = {});

// Raises the error of a table entry with level 1 and the report flag set, as the library always does.
[[noreturn]] void ThrowError(ErrorEntry const& entry, ReplacementValue const& r1 = {},
                             ReplacementValue const& r2 = {}, ReplacementValue const& r3 = {},
                             ReplacementValue const& r4 = {});

} // namespace orvcore::config
