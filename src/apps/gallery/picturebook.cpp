#include "apps/gallery/picturebook.h"

#include "apps/gallery/pickerplaces.h"

#include <QCursor>
#include <QDir>

#include <array>

namespace favrin::gallery {

using Picker = FVColorPickerViewController;

namespace {

struct Named
{
    const char *file;
    const char *caption;
};

constexpr std::array tabs = {Named{"grid", "Grid"}, Named{"spectrum", "Spectrum"}, Named{"sliders", "Sliders"}};
constexpr std::array colors = {Named{"no-color", "no color"}, Named{"opaque", "opaque"},
                               Named{"translucent", "translucent"}};
constexpr double sheetScale = 0.6;
constexpr int sheetWidth = 2130;
constexpr QSize portraitSize(360, 620);
constexpr QSize landscapeSize(568, 340);

constexpr QPoint farAway(-1000, -1000);

QColor background(bool dark)
{
    return dark ? QColor(0x26, 0x26, 0x29) : QColor(0xf2, 0xf2, 0xf6);
}

} // namespace

QString PictureBook::Look::caption() const
{
    return QStringLiteral("%1, %2").arg(
        layout == Layout::Landscape ? QStringLiteral("Landscape") : QStringLiteral("Portrait"),
        direction == Qt::RightToLeft ? QStringLiteral("right to left") : QStringLiteral("left to right"));
}

QString PictureBook::Look::fileName() const
{
    const QStringList parts = {
        QStringLiteral("picker"),
        QString::fromLatin1(tabs.at(static_cast<std::size_t>(tab)).file),
        layout == Layout::Landscape ? QStringLiteral("landscape") : QStringLiteral("portrait"),
        appearance == Appearance::Dark ? QStringLiteral("dark") : QStringLiteral("light"),
        direction == Qt::RightToLeft ? QStringLiteral("rtl") : QStringLiteral("ltr"),
        QString::fromLatin1(colors.at(static_cast<std::size_t>(color)).file),
    };
    return parts.join(u'-') + QStringLiteral(".png");
}

PictureBook::PictureBook(const QString &folder, Tour *tour)
    : QObject(tour)
    , m_folder(folder)
    , m_tour(tour)
    , m_container(m_window.contentItem())
    , m_finger(&m_window)
    , m_stillness(&m_window)
    , m_sheet(Qt::white)
{
    m_picker.setAllowsNoColor(true);
    connect(&m_picker, &Picker::preferredContentSizeChanged, this, &PictureBook::fitContainer);
}

void PictureBook::addEverything()
{
    addOpening();
    for (const Appearance appearance : {Appearance::Light, Appearance::Dark}) {
        for (const Layout layout : {Layout::Portrait, Layout::Landscape}) {
            for (const Qt::LayoutDirection direction : {Qt::LeftToRight, Qt::RightToLeft})
                addRow({appearance, direction, layout, 0, 0});
        }
        addSheet(appearance);
    }
    addClosing();
}

void PictureBook::addOpening()
{
    m_tour->add(
        QStringLiteral("opens the picture book"),
        [this] {
            wear({Appearance::Light, Qt::LeftToRight, Layout::Portrait, 0, 0});
            // The mouse is none of the pictures' business.
            QCursor::setPos(farAway);
            m_window.show();
            m_picker.embed(&m_container);
        },
        [this] { return m_picker.state() == Picker::State::Ready && m_stillness.isReached(); });
}

void PictureBook::addRow(Look look)
{
    m_tour->add(
        QStringLiteral("turns to: ") + look.caption(),
        [this, look] {
            wear(look);
            m_stillness.forget();
            m_sheet.addRow(look.caption());
        },
        [this] { return m_stillness.isReached(); });
    for (look.tab = 0; look.tab < static_cast<int>(tabs.size()); ++look.tab) {
        addTab(look);
        for (look.color = 0; look.color < static_cast<int>(colors.size()); ++look.color)
            addPicture(look);
    }
}

void PictureBook::addTab(const Look &look)
{
    m_tour->add(
        QStringLiteral("opens the tab ") + QString::fromLatin1(tabs.at(static_cast<std::size_t>(look.tab)).caption),
        [this, look] {
            const QQuickItem *view = m_picker.view();
            const QRectF segment = PickerPlaces(view->size(), look.direction).tabSegment(look.tab);
            m_finger.tap(view->mapToScene(segment.center()));
            m_stillness.forget();
        },
        [this] { return m_stillness.isReached(); });
}

void PictureBook::addPicture(const Look &look)
{
    m_tour->add(
        QStringLiteral("takes the picture ") + look.fileName(),
        [this, look] {
            setColor(look.color);
            m_stillness.forget();
        },
        [this, look] {
            if (!m_stillness.isReached())
                return false;
            if (!m_stillness.picture().save(QDir(m_folder).filePath(look.fileName())))
                m_tour->fail(QStringLiteral("the picture cannot be written"));
            m_sheet.addPicture(m_stillness.picture());
            return true;
        });
}

void PictureBook::addSheet(Appearance appearance)
{
    const QString name = appearance == Appearance::Dark ? QStringLiteral("picture-book-dark.png")
                                                        : QStringLiteral("picture-book-light.png");
    m_tour->add(
        QStringLiteral("draws the sheet ") + name,
        [this, name, appearance] {
            if (!m_sheet.draw(sheetScale, sheetWidth).save(QDir(m_folder).filePath(name)))
                m_tour->fail(QStringLiteral("the sheet cannot be written"));
            // The next one's.
            m_sheet = ContactSheet(appearance == Appearance::Light ? Qt::black : Qt::white);
        },
        [] { return true; });
}

void PictureBook::addClosing()
{
    m_tour->add(
        QStringLiteral("closes the picture book"),
        [this] {
            m_picker.dismiss();
            m_window.hide();
        },
        [this] { return m_picker.state() == Picker::State::NotRunning; });
}

void PictureBook::wear(const Look &look)
{
    const bool dark = look.appearance == Appearance::Dark;
    m_picker.setAppearance(dark ? Picker::Appearance::Dark : Picker::Appearance::Light);
    m_picker.setLayoutDirection(look.direction);
    m_window.setColor(background(dark));
    const QSize size = look.layout == Layout::Landscape ? landscapeSize : portraitSize;
    m_window.resize(size);
    m_container.setSize(size);
}

void PictureBook::setColor(int color)
{
    const std::array selections = {FVColor(), FVColor(0.0, 97.0 / 255, 253.0 / 255),
                                   FVColor(1.0, 0.42, 0.12, 0.3, FVColor::displayP3Name())};
    m_picker.setSelectedColor(selections.at(static_cast<std::size_t>(color)));
}

void PictureBook::fitContainer()
{
    const QSizeF wanted = m_picker.preferredContentSize();
    if (wanted.width() != m_container.width())
        return;
    m_container.setHeight(wanted.height());
    m_window.resize(m_container.size().toSize());
}

} // namespace favrin::gallery
