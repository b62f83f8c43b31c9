#pragma once

/// Chief header of writing: the writer that every `marshal` goes through, and the text forms of values.

#include "runtime/as_text.h"
#include "runtime/error_codes.h"
#include "runtime/namespaces.h"
#include "runtime/writer.h"
