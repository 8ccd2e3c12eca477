#pragma once

#include "platform/access/Design.h"
#include "platform/access/database/DesignBlob.h"

#include <memory>

namespace tovimar::platform::access {

/// A design as the blocks of its text export: a root of type "" with the leading properties and the block
/// of the form or report. Unknown properties are carried as "Unknown<code>", by slot ("UnknownSlot<slot>")
/// where the design keeps no codes. An embedded macro that can't be read is carried as bytes.
std::unique_ptr<DesignObject> BlobBlocks(const DesignBlob& design);

/// One property as it stands there, by name and value; an embedded macro as its bytes.
std::string RecordName(const DesignRecord& record);
PropertyValue RecordValue(const DesignRecord& record);

} // namespace tovimar::platform::access
