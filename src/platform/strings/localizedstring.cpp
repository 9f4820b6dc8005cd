#include "platform/strings/localizedstring.h"
