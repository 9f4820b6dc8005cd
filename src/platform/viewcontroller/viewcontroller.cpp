#include "platform/viewcontroller/viewcontroller.h"
