// Qt's widget color dialog: as a program of its own, or with --opening timed from its making in a running app to the
// end of its first flush: the first in that process, another one, and the same again. One JSON object is printed.

#include <QApplication>
#include <QColorDialog>
#include <QElapsedTimer>
#include <QTimer>
#include <QWindow>

#include <cstdio>
#include <cstring>
#include <memory>

namespace {

/** Tells when an event that paints a window has been handled. */
class Application : public QApplication
{
public:
    using QApplication::QApplication;
    QWindow *watched = nullptr;
    bool painted = false;

    bool notify(QObject *receiver, QEvent *event) override
    {
        const bool paints = event->type() == QEvent::Expose || event->type() == QEvent::Paint;
        const bool isTheWindow = watched && receiver == watched;
        const bool result = QApplication::notify(receiver, event);
        if (paints && isTheWindow && watched->isExposed())
            painted = true;
        return result;
    }
};

void rest(int milliseconds)
{
    QEventLoop loop;
    QTimer::singleShot(milliseconds, &loop, &QEventLoop::quit);
    loop.exec();
}

double open(Application &application, std::unique_ptr<QColorDialog> &dialog, QWidget *parent)
{
    application.painted = false;
    QElapsedTimer clock;
    clock.start();
    if (!dialog) {
        dialog = std::make_unique<QColorDialog>(parent);
        dialog->setOptions(QColorDialog::ShowAlphaChannel | QColorDialog::DontUseNativeDialog);
        dialog->winId();
    }
    application.watched = dialog->windowHandle();
    dialog->open();
    while (!application.painted)
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    const double time = double(clock.nsecsElapsed()) / 1e6;
    rest(200);
    dialog->hide();
    rest(100);
    return time;
}

} // namespace

int main(int argc, char *argv[])
{
    Application application(argc, argv);
    if (argc < 2 || std::strcmp(argv[1], "--opening") != 0) {
        QColorDialog dialog;
        dialog.setOptions(QColorDialog::ShowAlphaChannel | QColorDialog::DontUseNativeDialog);
        dialog.show();
        return QApplication::exec();
    }
    QWidget window;
    window.resize(900, 700);
    window.show();
    rest(300);
    std::unique_ptr<QColorDialog> dialog;
    const double first = open(application, dialog, &window);
    dialog.reset();
    const double another = open(application, dialog, &window);
    const double again = open(application, dialog, &window);
    std::printf("{\"first\": %.3f, \"another\": %.3f, \"again\": %.3f}\n", first, another, again);
    return 0;
}
