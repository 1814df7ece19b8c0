// SPDX-License-Identifier: Apache-2.0
//
// Which sections of a large file keep their contents in the file until somebody asks for them.
// Tables that the reader consumes are never asked about.
//
// Without a selector nothing is deferred: contents are then views of the image.
#pragma once

#include <cstdint>

namespace elfext {

class Section;

class DeferredContentsSelector {
public:
  virtual ~DeferredContentsSelector() = default;

  /// Asked once for each section that may be deferred; the size is in bytes.
  [[nodiscard]] virtual bool isDeferred(const Section& section, uint64_t size) = 0;
};

/// Defers what is larger than a threshold.
class BySizeDeferredContentsSelector final : public DeferredContentsSelector {
public:
  /// Bytes; 0 defers all sections that have contents.
  [[nodiscard]] uint64_t getThreshold() const { return m_Threshold; }
  void setThreshold(uint64_t threshold) { m_Threshold = threshold; }

  [[nodiscard]] bool isDeferred(const Section&, uint64_t size) override {
    return size > m_Threshold;
  }

private:
  uint64_t m_Threshold = 0;
};

} // namespace elfext
