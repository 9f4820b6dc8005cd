#pragma once

#include "model/somecolor.h"
#include "sliders/cptextfieldcoordinator.h"

namespace favrin::sliders {

/**
 * Of the hex field: the whole color as six digits in its own space. Color texts pasted in other forms become digits;
 * copying all digits offers the color as well as the text.
 */
class HexFieldCoordinator : public favrin::sliders::CPTextFieldCoordinator
{
    Q_OBJECT
    QML_ELEMENT

public:
    explicit HexFieldCoordinator(QObject *parent = nullptr);

    QString name() const override;

protected:
    bool handleKey(QKeyEvent &event) override;

private:
    CPTextField<model::SomeColor> textField();
};

} // namespace favrin::sliders
