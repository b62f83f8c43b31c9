#pragma once

/// Reading XML: everything that a caller of the reader needs.

#include "runtime/byte_source.h"
#include "runtime/cracked_name.h"
#include "runtime/dtd.h"
#include "runtime/entities.h"
#include "runtime/error.h"
#include "runtime/error_codes.h"
#include "runtime/event_map.h"
#include "runtime/list_tokeniser.h"
#include "runtime/must_understand.h"
#include "runtime/namespaces.h"
#include "runtime/reader.h"
#include "runtime/scanner.h"
#include "runtime/string_stack.h"
#include "runtime/utf8.h"
#include "runtime/utf8_decoder.h"
#include "runtime/white_space.h"
#include "runtime/xml_event.h"
#include "runtime/xml_text_source.h"
