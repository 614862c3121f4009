#pragma once
// The whole XML runtime.
#include "lmx/binary.h"
#include "lmx/error.h"
#include "lmx/read_source.h"
#include "lmx/regex.h"
#include "lmx/repository.h"
#include "lmx/text_escaping.h"
#include "lmx/value_conversion.h"
#include "lmx/xml_reader.h"
#include "lmx/xml_scanner.h"
#include "lmx/xml_writer.h"
