// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "host_interfaces/framework/ResultCodes.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// A person's name for a codec, from the four-character code of a sample
// description with the first character in the top byte. Empty with NCF_OK for a
// well-formed code that nobody knows; NCF_E_INVALIDARG for code 0 and for codes
// that are not printable.
NCFRESULT CodecName(ncfUInt32 code, std::string& name);

// The code of a stream's codec: its tag, or for a tag that is no text the code
// that the codec has in movies or elsewhere. What has none goes by the first
// letters of its name. 0 for codecs that nobody knows.
ncfUInt32 CodecCode(const AVCodecParameters& form);

// A person's name for a stream's codec; empty only for codecs that nobody knows.
std::string CodecNameOf(const AVCodecParameters& form);

// The code whose characters a tag of the library holds, the first in its lowest byte.
ncfUInt32 CodeOfTag(unsigned tag);

}  // namespace host
