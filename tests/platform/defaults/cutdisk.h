#pragma once

#include <QDir>
#include <QFile>
#include <QProcess>
#include <QStandardPaths>
#include <QTemporaryDir>

#include <fcntl.h>
#include <sys/ioctl.h>
#include <unistd.h>

#include <cstdint>
#include <utility>

/** A small disk in a file, whose power can be cut; needs the rights to mount one. */
class CutDisk
{
public:
    CutDisk()
    {
        QFile image(m_image);
        const bool isMade = image.open(QIODevice::WriteOnly) && image.resize(16 << 20);
        image.close();
        m_isMounted = isMade && ::geteuid() == 0 && QDir().mkpath(folder()) &&
                      run(QStringLiteral("mkfs.ext4"), {QStringLiteral("-q"), m_image}) && mount();
    }
    ~CutDisk() { unmount(); }
    CutDisk(const CutDisk &) = delete;
    CutDisk &operator=(const CutDisk &) = delete;

    QString folder() const { return m_folder.filePath(QStringLiteral("disk")); }
    bool isMounted() const { return m_isMounted; }

    /** From now on nothing reaches the disk, and what waits in memory is lost, the journal's newest part too. */
    bool cut() const
    {
        constexpr unsigned long shutDown = _IOR('X', 125, std::uint32_t);
        std::uint32_t withoutLog = 2;
        const int root = ::open(QFile::encodeName(folder()).constData(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
        const bool isCut = ::ioctl(root, shutDown, &withoutLog) == 0;
        ::close(root);
        return isCut;
    }
    /** As after the next start of the machine. */
    bool restart() { return unmount() && mount(); }

private:
    static bool run(const QString &program, const QStringList &arguments)
    {
        // Administrators' programs are not in everybody's path.
        const QString path = QStandardPaths::findExecutable(
            program, {QStringLiteral("/usr/sbin"), QStringLiteral("/sbin"), QStringLiteral("/usr/bin")});
        return !path.isEmpty() && QProcess::execute(path, arguments) == 0;
    }
    bool mount()
    {
        m_isMounted = run(QStringLiteral("mount"), {QStringLiteral("-o"), QStringLiteral("loop"), m_image, folder()});
        return m_isMounted;
    }
    bool unmount() { return !std::exchange(m_isMounted, false) || run(QStringLiteral("umount"), {folder()}); }

    QTemporaryDir m_folder;
    QString m_image = m_folder.filePath(QStringLiteral("image"));
    bool m_isMounted = false;
};
