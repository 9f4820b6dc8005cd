#pragma once

#include "apps/gallery/messagelog.h"
#include "apps/gallery/pickerpresenter.h"
#include "apps/gallery/poster.h"

namespace favrin::gallery {

/**
 * The app: a poster, the picker that colors its selected part, and the log of what the picker says. A pick goes to the
 * selected part; selecting another part or pasting a fill goes to the picker.
 */
class Gallery : public QObject
{
    Q_OBJECT
    QML_ELEMENT
    QML_UNCREATABLE("There is one gallery")

    Q_PROPERTY(favrin::gallery::Poster *poster READ poster CONSTANT)
    Q_PROPERTY(favrin::gallery::MessageLog *messages READ messages CONSTANT)
    Q_PROPERTY(favrin::gallery::PickerPresenter *presenter READ presenter CONSTANT)
    Q_PROPERTY(bool dark READ isDark WRITE setDark NOTIFY darkChanged)
    Q_PROPERTY(bool mirrored READ isMirrored WRITE setMirrored NOTIFY mirroredChanged)

public:
    explicit Gallery(QObject *parent = nullptr);

    Poster *poster() { return &m_poster; }
    MessageLog *messages() { return &m_messages; }
    PickerPresenter *presenter() { return &m_presenter; }
    FVColorPickerViewController *picker() { return &m_picker; }

    bool isDark() const;
    void setDark(bool dark);
    /** Laid out from right to left. */
    bool isMirrored() const;
    void setMirrored(bool mirrored);

Q_SIGNALS:
    void darkChanged();
    void mirroredChanged();

private:
    void connectPoster();
    void connectMessages();
    void offerEyedropper();
    void showSelectedPart();
    void takePick(const FVColor &color, const QString &colorspace, bool isVolatile);

    FVColorPickerViewController m_picker;
    Poster m_poster;
    MessageLog m_messages;
    PickerPresenter m_presenter;
};

} // namespace favrin::gallery
