// SPDX-License-Identifier: Apache-2.0
//
// The tags that say what a record says. They have to stay in step with record_from_tags.cpp and
// with the compilers that write both.
//
// It is run where an object states its attributes as text, so that the tags can be compared and
// written. Order counts where a tag is derived from another (the architecture's number comes first,
// the alignment last); setters with consequences are not used, as each would change the record that
// is being read.
#include "elfext/interface/build_attributes.h"
#include "elfext/interface/target_table.h"
#include "elfext/src/attributes/architecture_number.h"
#include "elfext/src/attributes/feature_chains.h"
#include "elfext/src/attributes/standard_tags.h"

#include <algorithm>

namespace elfext {

using namespace features;

// Writes tags without their consequences: the record stands.
class TagsFromRecord {
public:
  explicit TagsFromRecord(BuildAttributes& attributes)
      : m_Attributes(attributes), m_Features(attributes.m_FullAttr.m_Features) {}

  void derive() {
    deriveArchitecture();
    deriveExtensions();
    deriveFloatingPoint();
    deriveDivisionAndDsp();
    deriveAddressing();
    deriveFloatingPointModel();
    deriveMakersTags();
    deriveDataSizes();
    m_Attributes.followStackAlignment();
    m_Attributes.followInterworking();
    m_Attributes.m_FlagsStale = false;
  }

private:
  [[nodiscard]] bool has(FeatureSet set) const { return m_Features.contains(set); }
  [[nodiscard]] bool hasFlags(uint64_t bits) const {
    return (m_Attributes.m_FullAttr.m_Flags & bits) == bits;
  }
  [[nodiscard]] bool preservesStack8() const {
    return (m_Attributes.m_FullAttr.m_Stack8 & Stack8_Preserves) != 0;
  }
  template <class Tag>
  void set(Tag tag, uint32_t value) {
    m_Attributes.putNumber(placeOf(tag), value);
  }
  [[nodiscard]] uint32_t get(QobixTag tag) const { return m_Attributes.getNumber(placeOf(tag)); }
  void addAlsoFor(uint32_t architecture);

  void deriveArchitecture();
  void deriveExtensions();
  void deriveFloatingPoint();
  void deriveDivisionAndDsp();
  void deriveAddressing();
  void deriveFloatingPointModel();
  void setModel(uint32_t rounding, uint32_t denormal, uint32_t exceptions, uint32_t userExceptions,
                uint32_t model);
  void deriveMakersTags();
  void deriveEightByteAlignment();
  void derivePreload();
  void deriveDataSizes();

  BuildAttributes& m_Attributes;
  FeatureSet m_Features;
};

namespace {

uint32_t krellUse(uint32_t level, bool hasV8M) {
  if (level == 0) return 0;
  if (hasV8M) return 3;
  return level < 4 ? 1 : 2;
}

// The floating-point level as Tag_FP_arch has it: twice, for both sizes of the register file.
uint32_t floatingPointArchitecture(uint32_t level, bool hasD32) {
  if (level < 3) return level;
  if (level == 3) return hasD32 ? 3 : 4;
  if (level == 4) return hasD32 ? 5 : 6;
  return hasD32 ? 7 : 8;
}

uint32_t simdArchitecture(uint32_t level, bool hasNewest) {
  if (level < 4) return 1;
  if (level == 4) return 2;
  return hasNewest ? 4 : 3;
}

} // namespace

void TagsFromRecord::addAlsoFor(uint32_t architecture) {
  const AlsoCompatibilityTag entry = alsoForArchitecture(architecture);
  if (!m_Attributes.hasAlsoCompatibilityTag(entry)) m_Attributes.addAlsoCompatibilityTag(entry);
}

void TagsFromRecord::deriveArchitecture() {
  const IsaLevels levels = getIsaLevels(m_Features);
  // Nothing is known of the target: tags that are not there say that, and zeros would not.
  if (levels.zev == 0 && levels.krell == 0 && levels.z64 == 0) return;
  set(Tag_CPU_arch, getArchitectureNumber(m_Features));
  set(Tag_CPU_arch_profile, getArchitectureProfile(m_Features));
  set(Tag_ZEV_ISA_use, levels.zev != 0 ? 1 : 0);
  set(Tag_KRELL_ISA_use, krellUse(levels.krell, has(V8M_INSNS)));
  set(Tag_Z64_ISA_use, levels.z64 != 0 ? 1 : 0);
  // Code for either profile of level 8, and code for level 6 that needs nothing of the system.
  if (levels.zev == 8 && !m_Features.intersects(A_PROFILE | R_PROFILE)) addAlsoFor(15);
  if (levels.zev == 0 && levels.z64 == 0 && levels.krell < 4 &&
      !m_Features.intersects(M_PROFILE | OS_EXTENSION)) {
    addAlsoFor(11);
  }
}

void TagsFromRecord::deriveExtensions() {
  set(Tag_WMMX_arch, has(WMMX2_ISA) ? 2 : has(WMMX_ISA) ? 1 : 0);
  set(Tag_Virtualization_use,
      (has(SAFEZONE_ISA) ? 1u : 0u) + (has(VIRTUALIZATION_EXTENSION) ? 2u : 0u));
  set(Tag_K2EE_use, has(K2EE_ISA) ? 1 : 0);
}

void TagsFromRecord::deriveFloatingPoint() {
  const uint32_t level = getFloatingPointLevel(m_Features);
  const uint32_t architecture = floatingPointArchitecture(level, has(EXTREGS_D32));
  set(Tag_FP_arch, architecture);
  const bool hasNewestSimd = has(V81_SIMD) || has(HFU_HALF);
  set(Tag_Advanced_SIMD_arch, has(VECTA_ISA) ? simdArchitecture(level, hasNewestSimd) : 0);
  if (has(HFU_SINGLE) || has(HFU_DOUBLE))
    set(Tag_ABI_HardFP_use, has(HFU_SINGLE | HFU_DOUBLE) ? 0 : has(HFU_SINGLE) ? 1 : 2);
  const bool mayHaveHalf = architecture == 3 || architecture == 4;
  set(Tag_FP_HP_extension, architecture >= 5 || (mayHaveHalf && has(FP16)) ? 1 : 0);
}

void TagsFromRecord::deriveDivisionAndDsp() {
  set(Tag_MPextension_use, has(MP_EXTENSIONS) ? 1 : 0);
  set(Tag_DIV_use, get(Tag_CPU_arch) == 10 && has(DIVIDE_EXTENSION) ? 2 : 0);
  // Only said where the architecture does not say it already.
  const bool isImplied =
      hasFullFeatures(get(Tag_CPU_arch), get(Tag_CPU_arch_profile), V7EM_EXTENSION);
  set(Tag_DSP_extension, !isImplied && has(V7EM_EXTENSION) ? 1 : 0);
  const bool usesHardFp = getFloatingPointLevel(m_Features) > 0 && !has(SOFTFP);
  set(Tag_ABI_HFU_args, usesHardFp ? 1 : !has(PURE_DOUBLES) ? 3 : 0);
}

void TagsFromRecord::deriveAddressing() {
  set(Tag_CPU_unaligned_access, (m_Attributes.m_FullAttr.m_Access.data & Access_U41) != 0 ? 1 : 0);
  set(Tag_ABI_PCS_RO_data, hasFlags(Flag_Ropi) ? 1 : 0);
  set(Tag_ABI_PCS_GOT_use, hasFlags(Flag_Indirect) ? 2 : 1);
  if (hasFlags(Flag_Rwpi)) {
    set(Tag_ABI_PCS_R9_use, 1);
    set(Tag_ABI_PCS_RW_data, 2);
  } else {
    set(Tag_ABI_PCS_RW_data, hasFlags(Flag_FpicCode) ? 1 : 0);
    set(Tag_ABI_PCS_R9_use, hasFlags(Flag_UsesV6) ? 0 : 3);
  }
  set(Tag_ABI_align_preserved, preservesStack8() ? 1 : 0);
  set(Tag_ABI_optimization_goals, hasFlags(Flag_OptimizeTime)    ? 2
                                  : hasFlags(Flag_OptimizeSpace) ? 4
                                                                 : 0);
}

void TagsFromRecord::setModel(uint32_t rounding, uint32_t denormal, uint32_t exceptions,
                              uint32_t userExceptions, uint32_t model) {
  set(Tag_ABI_FP_rounding, rounding);
  set(Tag_ABI_FP_denormal, denormal);
  set(Tag_ABI_FP_exceptions, exceptions);
  set(Tag_ABI_FP_user_exceptions, userExceptions);
  set(Tag_ABI_FP_number_model, model);
}

void TagsFromRecord::deriveFloatingPointModel() {
  set(Tag_ABI_FP_optimization_goals, 0);
  if (!has(PURE_DOUBLES)) return setModel(0, 0, 0, 0, 0);
  if (hasFlags(Flag_IeeeFull)) {
    // This one tag stays as it was, present or not.
    const bool hadExceptions = m_Attributes.hasTag(Tag_ABI_FP_exceptions);
    setModel(1, 1, get(Tag_ABI_FP_exceptions), 1, 3);
    if (!hadExceptions) m_Attributes.dropNumber(placeOf(Tag_ABI_FP_exceptions));
    return;
  }
  if (hasFlags(Flag_IeeePart)) return setModel(0, 1, 0, 1, 3);
  if (hasFlags(Flag_IeeeJava)) return setModel(0, 1, 0, 0, 2);
  setModel(0, has(FZ_POSZERO) ? 0 : 2, 0, 0, 1);
}

void TagsFromRecord::deriveMakersTags() {
  set(ZevTag::Tag_ZV_interworking, hasFlags(Flag_Interwork) ? 0 : 1);
  set(ZevTag::Tag_ZV_cpp_exceptions, hasFlags(Flag_Exceptions) ? 1 : 0);
  set(ZevTag::Tag_ZV_mdivide, has(MARVELL_DIV) ? 1 : 0);
  set(ZevTag::Tag_ZV_standardlib, hasFlags(Flag_StandardLibrary) ? 1 : 0);
  set(ZevTag::Tag_ZV_microlib, hasFlags(Flag_MicroLibrary) ? 1 : 0);
  const bool requires8 = (m_Attributes.m_FullAttr.m_Stack8 & Stack8_Requires) != 0;
  set(ZevTag::Tag_ZV_require8, requires8 ? 0 : 1);
  deriveEightByteAlignment();
  derivePreload();
}

// Code that says nothing of the alignment of 8-byte data, and does not keep that of the stack, is
// taken to align to 4; the record then says so too.
void TagsFromRecord::deriveEightByteAlignment() {
  uint32_t eba = 1;
  if (hasFlags(Flag_Align8)) {
    eba = 0;
  } else if (hasFlags(Flag_Align4) || !preservesStack8()) {
    m_Attributes.m_FullAttr.m_Flags |= Flag_Align4;
    eba = 2;
  }
  set(ZevTag::Tag_ZV_eba, eba);
}

// The highest level counts.
void TagsFromRecord::derivePreload() {
  for (const FeatureSet level : PldChain) {
    if (!has(level)) continue;
    const auto value = std::ranges::find(PreloadsByTag, level) - PreloadsByTag.begin() + 1;
    set(ZevTag::Tag_ZV_pld, static_cast<uint32_t>(value));
  }
}

void TagsFromRecord::deriveDataSizes() {
  if (hasFlags(Flag_EnumInt)) set(Tag_ABI_enum_size, 2);
  if (hasFlags(Flag_WChar32)) set(Tag_ABI_PCS_wchar_t, 4);
}

AlsoCompatibilityTag alsoForArchitecture(uint32_t number) {
  return {Tag_CPU_arch, number, {}};
}

void BuildAttributes::deriveStandardTags() {
  TagsFromRecord(*this).derive();
}

void BuildAttributes::fixUpAfterDecoding() {
  const FullAttr& record = getFullAttr();
  if (record.m_Features.contains(PURE_DOUBLES)) {
    if ((record.m_Flags & Flag_IeeePart) == Flag_IeeePart)
      setNumericTag(Tag_ABI_FP_number_model, 3);
    else if ((record.m_Flags & Flag_IeeeJava) != 0)
      setNumericTag(Tag_ABI_FP_number_model, 2);
    else if (!record.m_Features.contains(FZ_POSZERO))
      setNumericTag(Tag_ABI_FP_denormal, 2);
  }
  if (getNumericTag(Tag_CPU_arch) == 1 && getFullAttr().m_Features.contains(OS_EXTENSION))
    setNumericTag(Tag_CPU_arch, 2);
}

} // namespace elfext
