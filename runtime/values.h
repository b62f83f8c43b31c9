#pragma once

/// The value side of the runtime: conversions, checks, the value classes and their text forms.

#include "runtime/any_info.h"
#include "runtime/as_text.h"
#include "runtime/big_int.h"
#include "runtime/binary.h"
#include "runtime/date_time.h"
#include "runtime/decimal.h"
#include "runtime/duration.h"
#include "runtime/empty.h"
#include "runtime/error_codes.h"
#include "runtime/number_text.h"
#include "runtime/pattern.h"
#include "runtime/text_checks.h"
#include "runtime/text_conversions.h"
