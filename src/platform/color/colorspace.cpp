#include "platform/color/colorspace.h"
