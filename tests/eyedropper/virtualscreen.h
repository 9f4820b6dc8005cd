#pragma once

#include <QByteArray>
#include <QImage>
#include <QProcess>
#include <QString>

#include <cstdlib>

#include <unistd.h>
#include <xcb/xcb.h>

/** An X server without a display, with a pointer and keys that the test moves. */
class VirtualScreen
{
public:
    ~VirtualScreen()
    {
        m_server.terminate();
        m_server.waitForFinished();
    }

    /** False when it cannot be started. */
    bool start(const QString &geometry = QStringLiteral("1000x800x24"))
    {
        // It chooses a free number by itself and says which.
        int ends[2];
        if (pipe(ends) != 0)
            return false;
        m_server.setChildProcessModifier([write = ends[1]] { dup2(write, numberDescriptor); });
        m_server.setProcessChannelMode(QProcess::ForwardedChannels);
        m_server.start(QStringLiteral("Xvfb"),
                       {QStringLiteral("-displayfd"), QString::number(numberDescriptor), QStringLiteral("-screen"),
                        QStringLiteral("0"), geometry, QStringLiteral("-nolisten"), QStringLiteral("tcp"),
                        QStringLiteral("-noreset")});
        close(ends[1]);
        QByteArray number;
        for (char digit = 0; read(ends[0], &digit, 1) == 1 && digit != '\n';)
            number.append(digit);
        close(ends[0]);
        m_name = u':' + QString::fromLatin1(number);
        return !number.isEmpty();
    }

    /** What DISPLAY is for the programs on this screen. */
    QString name() const { return m_name; }

    /** Lets a tool act on the screen and waits for it; false when it fails. */
    bool run(const QString &program, const QStringList &arguments) const
    {
        QProcess tool;
        auto environment = QProcessEnvironment::systemEnvironment();
        environment.insert(QStringLiteral("DISPLAY"), m_name);
        tool.setProcessEnvironment(environment);
        tool.setProcessChannelMode(QProcess::ForwardedChannels);
        tool.start(program, arguments);
        return tool.waitForFinished() && tool.exitStatus() == QProcess::NormalExit && tool.exitCode() == 0;
    }
    bool input(const QStringList &arguments) const { return run(QStringLiteral("xdotool"), arguments); }

private:
    static constexpr int numberDescriptor = 77;

    QProcess m_server;
    QString m_name;
};

/** Makes the picture the background of the whole screen. */
inline void showOnRoot(xcb_connection_t *connection, const QImage &picture)
{
    const xcb_screen_t *screen = xcb_setup_roots_iterator(xcb_get_setup(connection)).data;
    const auto width = static_cast<quint16>(picture.width());
    const auto height = static_cast<quint16>(picture.height());
    const xcb_pixmap_t pixmap = xcb_generate_id(connection);
    const xcb_gcontext_t context = xcb_generate_id(connection);
    xcb_create_pixmap(connection, screen->root_depth, pixmap, screen->root, width, height);
    xcb_create_gc(connection, context, pixmap, 0, nullptr);
    xcb_put_image(connection, XCB_IMAGE_FORMAT_Z_PIXMAP, pixmap, context, width, height, 0, 0, 0, screen->root_depth,
                  static_cast<quint32>(picture.sizeInBytes()), picture.constBits());
    xcb_change_window_attributes(connection, screen->root, XCB_CW_BACK_PIXMAP, &pixmap);
    xcb_clear_area(connection, 0, screen->root, 0, 0, 0, 0);
    // It has happened when the server answers.
    std::free(xcb_get_input_focus_reply(connection, xcb_get_input_focus(connection), nullptr));
}
