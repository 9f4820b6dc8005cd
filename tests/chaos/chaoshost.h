#pragma once

#include "../road/roadhost.h"

#include "service/favoritesstore.h"

#include <QGuiApplication>
#include <QTemporaryDir>

#include <chrono>
#include <random>
#include <thread>

/** A host whose picker shows the favorites right below the tabs, and moves nothing slowly. */
class ChaosHost : public RoadHost
{
public:
    ChaosHost()
    {
        picker.setShowsAlpha(false);
        picker.setReduceMotion(true);
    }

    bool isUnharmed() const { return isReady() && terminated.isEmpty(); }
    /** A click that is answered, after all that came before it. */
    bool picksAt(QPoint place)
    {
        picks.clear();
        click(place);
        return QTest::qWaitFor([this] { return hasFinalPick(); });
    }
    /** Keeps @p color as the favorite of this number, counted from 0; there is room for eight on the first page. */
    void addFavorite(const FVColor &color, int number)
    {
        picker.setSelectedColor(color);
        click(favorite(number / 4, number % 4));
    }
    /** A step of a drag over the grid, back and forth. */
    void dragStep(int step) { QTest::mouseMove(&window, swatch(step / 12 % 10, step % 12)); }
};

inline FVColor gray(int number)
{
    return {number / 255.0, number / 255.0, number / 255.0};
}

/** Hexadecimal digits of the favorites of a new user, and behind them of grays from 100 on. */
inline QStringList favoritesWith(int grays)
{
    QStringList list = QStringLiteral("000000 0061fd 33c759 ffcc01 ff3a2f").split(u' ');
    for (int number = 0; number < grays; ++number)
        list << gray(100 + number).toQColor().name().mid(1);
    return list;
}

/** The settings of the processes that a test starts. */
class Settings
{
public:
    Settings() { qputenv("FAVRIN_DEFAULTS_FILE", QFile::encodeName(file())); }

    QString folder() const { return m_folder.path(); }
    QString file() const { return m_folder.path() + QStringLiteral("/defaults.sqlite"); }
    QStringList entries() const
    {
        return QDir(folder()).entryList(QDir::AllEntries | QDir::System | QDir::NoDotAndDotDot);
    }
    void clear() const
    {
        for (const auto &entry : entries()) {
            const QString path = folder() + u'/' + entry;
            if (!QFile::remove(path))
                QDir(path).removeRecursively();
        }
    }
    /** As the next picker would find them, in hexadecimal digits. */
    QStringList favorites() const
    {
        favrin::platform::UserDefaults defaults(file().toStdString());
        QStringList texts;
        for (const auto &color : favrin::service::FavoritesStore(defaults).favoriteColors(true))
            texts << QColor::fromRgbF(float(color.r), float(color.g), float(color.b)).name().mid(1);
        return texts;
    }

private:
    QTemporaryDir m_folder;
};

/**
 * Whether the picker may have shown these favorites: those of a new user, and behind them some of the three grays that
 * a test adds one after the other. A color that follows quickly may replace one that the picker has not taken in yet.
 */
inline bool wasShown(const QStringList &favorites)
{
    const QStringList added = favorites.mid(5);
    const QStringList grays = favoritesWith(3).mid(5);
    const bool known = std::ranges::all_of(added, [&](const QString &color) { return grays.contains(color); });
    return favorites.mid(0, 5) == favoritesWith(0) && added.size() <= 3 && known && std::ranges::is_sorted(added);
}

/** Sends a signal at a moment that has nothing to do with what this thread is doing. */
class SignalSoon
{
public:
    SignalSoon(pid_t process, int signal, std::chrono::microseconds delay)
        : m_thread([=] {
            std::this_thread::sleep_for(delay);
            ::kill(process, signal);
        })
    {
    }
    ~SignalSoon() { m_thread.join(); }
    SignalSoon(const SignalSoon &) = delete;
    SignalSoon &operator=(const SignalSoon &) = delete;

private:
    std::thread m_thread;
};

/** How often a test tries; "FAVRIN_CHAOS_ROUNDS=1000" makes the long version of it. */
inline int chaosRounds(int usually)
{
    bool isSet = false;
    const int rounds = qEnvironmentVariableIntValue("FAVRIN_CHAOS_ROUNDS", &isSet);
    return isSet ? rounds : usually;
}
