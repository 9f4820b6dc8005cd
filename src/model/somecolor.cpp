#include "model/somecolor.h"
