#pragma once

#include <QtCore/qglobal.h>

#if defined(FAVRIN_HOST_LIBRARY)
#define FAVRIN_HOST_EXPORT Q_DECL_EXPORT
#else
#define FAVRIN_HOST_EXPORT Q_DECL_IMPORT
#endif
