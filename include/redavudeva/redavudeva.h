// The whole public surface of the Redavudeva colour-chart library.
#pragma once

#include "redavudeva/color_patch.h"
#include "redavudeva/export.h"
#include "redavudeva/records.h"
#include "redavudeva/swatchlog_base.h"
#include "redavudeva/swatchlog_factory.h"
