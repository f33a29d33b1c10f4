// The plug-in module's one application object.
#include "core/KalmoretApp.h"

CKalmoretApp theApp;
