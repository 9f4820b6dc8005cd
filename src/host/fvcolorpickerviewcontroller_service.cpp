#include "host/fvcolorpickerviewcontroller.h"

#include "host/remotepicker.h"
#include "host/serviceahead.h"
#include "host/serviceprocess.h"

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
    return favrin::host::ServiceProcess::program();
}
