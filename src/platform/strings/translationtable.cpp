#include "platform/strings/translationtable.h"

#include "platform/strings/languagematch.h"
#include "platform/strings/localizedstring.h"

#include <QDir>
#include <QTranslator>

#include <algorithm>
#include <memory>
#include <string>
#include <vector>

namespace favrin::platform {

namespace {

// The tag comes from the host process and becomes a part of a path.
bool isLanguageTag(QStringView tag)
{
    return !tag.isEmpty() && tag.size() <= 64 && std::all_of(tag.begin(), tag.end(), [](QChar c) {
        return (c.unicode() < 128 && c.isLetterOrNumber()) || c == u'-';
    });
}

const QString &folder()
{
    static const QString path = QStringLiteral(":/favrin/translations");
    return path;
}

std::shared_ptr<const QTranslator> translatorFor(const QString &tag)
{
    auto translator = std::make_shared<QTranslator>();
    if (!isLanguageTag(tag) || !translator->load(QStringLiteral("Localizable_%1.qm").arg(tag), folder(), {}, {}))
        return nullptr;
    return translator;
}

std::vector<std::string> availableLanguages()
{
    constexpr int before = std::char_traits<char>::length("Localizable_");
    constexpr int after = std::char_traits<char>::length(".qm");
    std::vector<std::string> tags;
    for (const QString &name : QDir(folder()).entryList({QStringLiteral("Localizable_*.qm")}, QDir::Files, QDir::Name))
        tags.push_back(name.chopped(after).mid(before).toStdString());
    return tags;
}

QString bestLanguageFor(QStringView locale)
{
    if (!isLanguageTag(locale))
        return {};
    return QString::fromStdString(bestLanguage(locale.toString().toStdString(), availableLanguages()));
}

std::string translated(const QTranslator &translator, std::string_view key)
{
    const std::string terminatedKey(key);
    const QString text = translator.translate("Localizable", terminatedKey.c_str());
    return text.isEmpty() ? terminatedKey : text.toStdString();
}

} // namespace

QString installTranslations(QStringView locale)
{
    // Most locales have a file of their own name; looking for the best one costs more than reading it.
    QString tag = locale.toString();
    std::shared_ptr<const QTranslator> translator = translatorFor(tag);
    if (!translator)
        translator = translatorFor(tag = bestLanguageFor(locale));
    if (!translator)
        translator = translatorFor(tag = QStringLiteral("en"));
    if (!translator) {
        setStringTable({});
        return {};
    }
    setStringTable([translator](std::string_view key) { return translated(*translator, key); });
    return tag;
}

} // namespace favrin::platform
