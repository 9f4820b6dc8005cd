#pragma once

#include "model/colordescription.h"
#include "model/somecolor.h"

#include <QAccessible>

#include <private/qguiapplication_p.h>
#include <qpa/qplatformaccessibility.h>
#include <qpa/qplatformintegration.h>

/** What elements have said to assistive technologies: the kind of news, and their name. */
using Announcements = QList<std::pair<QAccessible::Event, QString>>;

inline Announcements &announcements()
{
    static Announcements list;
    return list;
}

/** As if an assistive technology were running, which hears of elements of a role; there is no public way to say so. */
template<QAccessible::Role role>
void startAssistiveTechnology()
{
    QAccessible::installUpdateHandler([](QAccessibleEvent *event) {
        if (const auto *element = event->accessibleInterface(); element && element->role() == role)
            announcements().append({event->type(), element->text(QAccessible::Name)});
    });
    QGuiApplicationPrivate::platformIntegration()->accessibility()->setActive(true);
}

inline QString nameOf(const favrin::model::SomeColor &color)
{
    return QString::fromStdString(favrin::model::colorDescription(color.platformColor()));
}
