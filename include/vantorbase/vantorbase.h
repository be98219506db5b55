// VantorBase: every public header of the library.
#ifndef VANTORBASE_VANTORBASE_H
#define VANTORBASE_VANTORBASE_H

#include "vantorbase/export.h"
#include "vantorbase/text.h"
#include "vantorbase/property.h"
#include "vantorbase/observer.h"
#include "vantorbase/mvc.h"
#include "vantorbase/command_desc.h"
#include "vantorbase/command.h"
#include "vantorbase/thread.h"
#include "vantorbase/mutex.h"
#include "vantorbase/timer.h"
#include "vantorbase/library.h"

#endif  // VANTORBASE_VANTORBASE_H
