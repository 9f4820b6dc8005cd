#include "platform/strings/translationtable.h"

#include "platform/strings/localizedstring.h"

#include <QString>
#include <QTranslator>

#include <algorithm>
#include <memory>

namespace favrin::platform {

namespace {

// The tag comes from the host process and becomes a part of a path.
bool isLanguageTag(QStringView tag)
{
    return !tag.isEmpty() && tag.size() <= 64 && std::all_of(tag.begin(), tag.end(), [](QChar c) {
        return (c.unicode() < 128 && c.isLetterOrNumber()) || c == u'-';
    });
}

std::shared_ptr<const QTranslator> translatorFor(QStringView locale)
{
    auto translator = std::make_shared<QTranslator>();
    for (QStringView tag = locale; isLanguageTag(tag); tag = tag.left(tag.lastIndexOf(u'-'))) {
        if (translator->load(QStringLiteral(":/favrin/translations/Localizable_%1.qm").arg(tag)))
            return translator;
        if (!tag.contains(u'-'))
            break;
    }
    return nullptr;
}

std::string translated(const QTranslator &translator, std::string_view key)
{
    const std::string terminatedKey(key);
    const QString text = translator.translate("Localizable", terminatedKey.c_str());
    return text.isEmpty() ? terminatedKey : text.toStdString();
}

} // namespace

TranslationLoading installTranslations(QStringView locale)
{
    const std::shared_ptr<const QTranslator> translator = translatorFor(locale);
    if (!translator) {
        setStringTable({});
        return TranslationLoading::NotFound;
    }
    setStringTable([translator](std::string_view key) { return translated(*translator, key); });
    return TranslationLoading::Loaded;
}

} // namespace favrin::platform
