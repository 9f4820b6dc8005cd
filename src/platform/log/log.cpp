#include "platform/log/log.h"

#include <QLoggingCategory>

namespace favrin::platform {

namespace {

QString text(std::string_view message)
{
    return QString::fromUtf8(message.data(), static_cast<qsizetype>(message.size()));
}

} // namespace

struct Log::Private
{
    Private(const char *subsystem, const char *categoryName)
        : name(QByteArray(subsystem) + '.' + categoryName), category(name.constData(), QtInfoMsg)
    {
    }
    // The category keeps a pointer to its name.
    const QByteArray name;
    const QLoggingCategory category;
};

Log::Log(const char *subsystem, const char *category) : d(std::make_unique<Private>(subsystem, category)) {}

Log::~Log() = default;

bool Log::isDebugEnabled() const
{
    return d->category.isDebugEnabled();
}

void Log::debug(std::string_view message) const
{
    qCDebug(d->category).noquote() << text(message);
}

void Log::warning(std::string_view message) const
{
    qCWarning(d->category).noquote() << text(message);
}

void Log::error(std::string_view message) const
{
    qCCritical(d->category).noquote() << text(message);
}

} // namespace favrin::platform
