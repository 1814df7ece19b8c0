// SPDX-License-Identifier: Apache-2.0
//
// From two tables of this system's own: the records of debug overlay sections, and the segments
// that notes give to sections.
//
// Both were checked with the tables, down to each index; here only numbers become pointers.
#include "elfext/src/model/module_builder.h"
#include "elfext/src/reader/object_module_reader.h"

namespace elfext {

void takeDebugOverlays(ReadContext& context) {
  ObjectModule& module = context.module;
  for (const DebugOverlayRow& row : context.debugOverlayRows)
    module.addDebugOverlayRecord(
        {row.word, module.getSection(row.debugSection), module.getSection(row.section)});
}

void takeSegmentMaps(ReadContext& context) {
  for (uint32_t i = 0; i < context.notedSegments.size(); ++i) {
    const uint32_t segment = context.notedSegments[i];
    if (segment == NoSegment) continue;
    ModuleBuilder::setSegment(*context.module.getSection(i), context.module.getSegment(segment));
  }
}

} // namespace elfext
