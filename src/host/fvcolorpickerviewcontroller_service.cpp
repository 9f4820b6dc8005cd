#include "host/fvcolorpickerviewcontroller.h"

#include "host/session/launchedservice.h"
#include "host/session/remotepicker.h"
#include "host/session/serviceahead.h"

#include <QCoreApplication>

// What the class says and does about the process; the library for apps' tests has none.

void FVColorPickerViewController::startServiceAhead()
{
    auto &ahead = favrin::host::ServiceAhead::instance();
    if (QCoreApplication::instance())
        ahead.start(favrin::host::RemotePicker().traits());
    else
        ahead.launch();
}

QString FVColorPickerViewController::servicePath()
{
    return QString::fromLocal8Bit(favrin::host::servicePath().c_str());
}
