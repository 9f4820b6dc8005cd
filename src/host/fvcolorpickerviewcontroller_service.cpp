#include "host/fvcolorpickerviewcontroller.h"

#include "host/remotepicker.h"
#include "host/serviceahead.h"
#include "host/serviceprocess.h"

// What the class says and does about the process; the library for apps' tests has none.

void FVColorPickerViewController::startServiceAhead()
{
    favrin::host::ServiceAhead::instance().start(favrin::host::RemotePicker().traits());
}

QString FVColorPickerViewController::servicePath()
{
    return favrin::host::ServiceProcess::program();
}
