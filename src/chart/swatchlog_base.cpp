#include "redavudeva/swatchlog_base.h"
