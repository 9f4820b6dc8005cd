#include "platform/color/color.h"
