// Localised user-visible text. Strings are written "$$$/key/path=Default text"; the localiser gives
// the translation registered for "key/path", else the default text after the first "=".
#pragma once

#include <map>
#include <mutex>
#include <string>

namespace orvcore::config {

class Localizer {
public:
    // The process's localiser.
    static Localizer& Get();

    // The UTF-16 text of a localisation string. Text that does not start with "$$$/" comes back
    // unchanged (converted); a localisation string without "=" has no default and gives its key path,
    // so a missing text is visible rather than blank.
    std::u16string Localize(std::string const& text) const;

    // Registers the translation of a key path (the part between "$$$/" and "=").
    void SetTranslation(std::string const& keyPath, std::u16string text);
    void RemoveTranslation(std::string const& keyPath);
    void ClearTranslations();

    // The key path of a localisation string, or empty when the text is not one.
    static std::string KeyPath(std::string const& text);

private:
    Localizer() = default;

    // Errors may be raised on worker threads too, so the table is guarded.
    mutable std::mutex mutex_;
    std::map<std::string, std::u16string> translations_;
};

} // namespace orvcore::config
