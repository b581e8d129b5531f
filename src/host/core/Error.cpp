// Raising errors: localise the key, fill the placeholders, throw.
#include "host/core/Error.h"

#include "host/core/ErrorTable.h"
#include "host/core/Localizer.h"
#include "host/core/StringUtils.h"
#include "host/core/TextConversion.h"

#include <iterator>

namespace orvcore::config {

ReplacementValue::ReplacementValue(std::string const& utf8)
    : text_(utility::UTF8to16(utf8)) {}

ReplacementValue::ReplacementValue(char const* utf8)
    : text_(utility::UTF8to16(utf8 ? utf8 : "")) {}

ReplacementValue::ReplacementValue(long long number)
    : text_(utility::AsciiToUTF16(std::to_string(number))) {}

Error::Error(int level, std::string key, int facility, int code, bool report, std::u16string message)
    : level_(level)
    , key_(std::move(key))
    , facility_(facility)
    , code_(code)
    , report_(report)
    , message_(std::move(message))
    , what_(utility::UTF16to8(message_)) {}

ErrorEntry const* Error::Entry() const {
    return FindErrorEntry(facility_, code_);
}

void ThrowError(int level, std::string const& key, int facility, int code, bool report,
                ReplacementValue const& r1, ReplacementValue const& r2, ReplacementValue const& r3,
                ReplacementValue const& r4) {
    std::u16string message =
        utility::ReplaceInString(Localizer::Get().Localize(key), r1.Text(), r2.Text(), r3.Text(), r4.Text());
    throw Error(level, key, facility, code, report, std::move(message));
}

void ThrowError(ErrorEntry const& entry, ReplacementValue const& r1, ReplacementValue const& r2,
                ReplacementValue const& r3, ReplacementValue const& r4) {
    ThrowError(1, entry.key, entry.facility, entry.code, true, r1, r2, r3, r4);
}

namespace {

constexpr ErrorEntry Table[] = {
    errors::CannotCreateOverlayWindow,
    errors::CannotCreateEmptyOverlayWindow,
    errors::InvalidWorkspace,
    errors::UnableToLoadWorkspace,
    errors::WorkspaceManagerAlreadyInitialized,
    errors::WorkspaceManagerNotInitialized,
    errors::WorkspaceAlreadyExists,
    errors::CannotCreateWorkspace,
    errors::UnknownWorkspace,
    errors::UnableToAccessResource,
    errors::InvalidTypeConversion,
    errors::NonInvertibleMatrix,
    errors::InvalidToolMapAccess,
    errors::MalformedPropList,
    errors::CannotReadFile,
    errors::CannotWriteFile,
};

} // namespace

ErrorEntry const* ErrorTableBegin() {
    return std::begin(Table);
}
ErrorEntry const* ErrorTableEnd() {
    return std::end(Table);
}

ErrorEntry const* FindErrorEntry(int facility, int code) {
    for (ErrorEntry const& e : Table) {
        if (e.facility == facility && e.code == code) {
            return &e;
        }
    }
    return nullptr;
}

} // namespace orvcore::config
