// The localiser's lookup: translation table first, then the default text in the string itself.
#include "host/core/Localizer.h"

#include "host/core/TextConversion.h"

namespace orvcore::config {

namespace {
constexpr char Prefix[] = "$$$/";
constexpr std::size_t PrefixLength = sizeof(Prefix) - 1;

bool IsLocalizationString(std::string const& text) {
    return text.compare(0, PrefixLength, Prefix) == 0;
}
} // namespace

Localizer& Localizer::Get() {
    static Localizer instance;
    return instance;
}

std::string Localizer::KeyPath(std::string const& text) {
    if (!IsLocalizationString(text)) {
        return {};
    }
    std::size_t eq = text.find('=', PrefixLength);
    return text.substr(PrefixLength, eq == std::string::npos ? std::string::npos : eq - PrefixLength);
}

std::u16string Localizer::Localize(std::string const& text) const {
    if (!IsLocalizationString(text)) {
        return utility::UTF8to16(text);
    }
    std::string keyPath = KeyPath(text);
    {
        std::lock_guard<std::mutex> lock(mutex_);
        auto it = translations_.find(keyPath);
        if (it != translations_.end()) {
            return it->second;
        }
    }
    std::size_t eq = text.find('=', PrefixLength);
    if (eq == std::string::npos) {
        return utility::UTF8to16(keyPath);
    }
    return utility::UTF8to16(text.substr(eq + 1));
}

void Localizer::SetTranslation(std::string const& keyPath, std::u16string text) {
    std::lock_guard<std::mutex> lock(mutex_);
    translations_[keyPath] = std::move(text);
}

void Localizer::RemoveTranslation(std::string const& keyPath) {
    std::lock_guard<std::mutex> lock(mutex_);
    translations_.erase(keyPath);
}

void Localizer::ClearTranslations() {
    std::lock_guard<std::mutex> lock(mutex_);
    translations_.clear();
}

} // namespace orvcore::config
