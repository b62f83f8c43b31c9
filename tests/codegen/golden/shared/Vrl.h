// Generated from schema/. To change it, change the schema.
#pragma once

/// Chief header of the document model: every class of the format, and the entry points of `Vrl`.

#include "V2/document_result.h"
#include "V2/group.h"
