// SPDX-License-Identifier: Apache-2.0
//
// The record that says what tags say. A tag that is not there counts as 0 where a rule covers every
// value; where a rule knows only some values it does nothing.
//
// It is run by BuildAttributes when somebody asks for a record whose tags have changed. Values are
// a file's and may be any: tables are indexed only behind a comparison, and a number that stands
// for nothing is the target of the empty name. The same knowledge the other way round is in
// tags_from_record.cpp.
#include "elfext/interface/attribute_string.h"
#include "elfext/interface/build_attributes.h"
#include "elfext/interface/target_table.h"
#include "elfext/src/attributes/feature_chains.h"
#include "elfext/src/attributes/standard_tags.h"

namespace elfext {

using namespace features;

// The order of the steps counts where two of them touch the same bit.
class RecordFromTags {
public:
  explicit RecordFromTags(const BuildAttributes& tags) : m_Tags(tags) {}

  [[nodiscard]] FullAttr make() {
    // First the architecture with all that it has; then what single tags add to it or take away.
    addTarget();
    narrowTarget();
    addExtensions();
    addFloatingPoint();
    addDsp();
    addAddressing();
    addAlignment();
    addFloatingPointModel();
    addMakersFlags();
    addMakersFeatures();
    addDataSizes();
    return m_Record;
  }

private:
  template <class Tag>
  [[nodiscard]] bool has(Tag tag) const {
    return m_Tags.hasNumber(placeOf(tag));
  }
  template <class Tag>
  [[nodiscard]] uint32_t get(Tag tag) const {
    return m_Tags.getNumber(placeOf(tag));
  }
  void apply(std::string_view options) { applyFlagString(m_Record.m_Flags, options); }
  // What a tag of value 0 or 1 says; nothing for other values, or without the tag.
  template <class Tag>
  void applyEither(Tag tag, std::string_view for0, std::string_view for1) {
    if (has(tag) && get(tag) <= 1) apply(get(tag) == 0 ? for0 : for1);
  }
  void putStack8(uint64_t bit, bool isSet) {
    m_Record.m_Stack8 = isSet ? m_Record.m_Stack8 | bit : m_Record.m_Stack8 & ~bit;
  }
  [[nodiscard]] Target getOwnTarget() const;

  void addTarget();
  void narrowTarget();
  void addExtensions();
  void addFloatingPoint();
  void addDsp();
  void addAddressing();
  void addPosition();
  void addAlignment();
  void addFloatingPointModel();
  void addMakersFlags();
  void addMakersFeatures();
  void addDataSizes();

  const BuildAttributes& m_Tags;
  FullAttr m_Record = DefaultFullAttr;
};

Target RecordFromTags::getOwnTarget() const {
  if (!has(Tag_CPU_arch)) return findTarget("");
  const uint32_t architecture = get(Tag_CPU_arch);
  if (get(Tag_Z64_ISA_use) != 0) return findTarget(architecture == 14 ? "8-A.64" : "");
  return findTargetForArchitecture(architecture, get(Tag_CPU_arch_profile));
}

void RecordFromTags::addTarget() {
  const Target target = getOwnTarget();
  m_Record.m_Features = target.features;
  m_Record.m_TargetClass = target.targetClass;
  m_Record.m_Access = has(Tag_CPU_arch) ? defaultAccessWords(get(Tag_CPU_arch), "")
                                        : AccessWords::all(AccessWord_Halves);
  FeatureSet unused;
  // The processor may have it, but the code does not use it.
  if (get(Tag_KRELL_ISA_use) == 0) unused |= KRELL_ISAv5;
  if (get(Tag_ZEV_ISA_use) == 0) unused |= ZEV_ISAv8;
  if (get(Tag_Z64_ISA_use) == 0) unused |= Z64_ISA;
  m_Record.m_Features = m_Record.m_Features.without(unused);
}

// Code that can also be used on other architectures needs only what they all have.
void RecordFromTags::narrowTarget() {
  for (uint32_t i = 0; i < m_Tags.getAlsoCompatibilityTagCount(); ++i) {
    AlsoCompatibilityTag entry;
    m_Tags.getAlsoCompatibilityTag(i, entry);
    if (entry.tag != Tag_CPU_arch || !entry.number) continue;
    m_Record.m_Features &= findTargetForArchitecture(*entry.number, 0).features;
    m_Record.m_Access = m_Record.m_Access & defaultAccessWords(*entry.number, "");
  }
}

void RecordFromTags::addExtensions() {
  FeatureSet& features = m_Record.m_Features;
  if (has(Tag_WMMX_arch)) {
    features.put(WMMX_ISA, get(Tag_WMMX_arch) >= 1);
    features.put(WMMX2_ISA.without(WMMX_ISA), get(Tag_WMMX_arch) >= 2);
  }
  if (has(Tag_Advanced_SIMD_arch)) features.put(VECTA_ISA, get(Tag_Advanced_SIMD_arch) != 0);
  if (has(Tag_Virtualization_use)) {
    features.put(SAFEZONE_ISA, (get(Tag_Virtualization_use) & 1) != 0);
    features.put(VIRTUALIZATION_EXTENSION, (get(Tag_Virtualization_use) & 2) != 0);
  }
  if (has(Tag_K2EE_use)) features.put(K2EE_ISA, get(Tag_K2EE_use) != 0);
  if (has(Tag_MPextension_use)) features.put(MP_EXTENSIONS, get(Tag_MPextension_use) != 0);
  // Other values leave what the architecture has.
  if (get(Tag_DIV_use) == 2) features |= DIVIDE_EXTENSION;
}

void RecordFromTags::addFloatingPoint() {
  if (!has(Tag_FP_arch)) return;
  constexpr FeatureSet Fused = VFMA_EXTENSION | FP16;
  // By the tag's value.
  constexpr FeatureSet Units[] = {{},
                                  HFU_ISAv1 | EXTREGS_D16,
                                  HFU_ISAv2 | EXTREGS_D16,
                                  HFU_ISAv3 | EXTREGS_D32,
                                  HFU_ISAv3 | EXTREGS_D16,
                                  HFU_ISAv3 | EXTREGS_D32 | Fused,
                                  HFU_ISAv3 | EXTREGS_D16 | Fused,
                                  FP_ISA_ZEVv8 | EXTREGS_D32 | Fused,
                                  HFU_ISAv5 | EXTREGS_D16 | Fused};
  FeatureSet& features = m_Record.m_Features;
  features = features.without(FP_ISA_ZEVv8 | HFU_SINGLE | HFU_DOUBLE | EXTREGS_D32 | Fused |
                              HFU_HALF | V81_SIMD);
  const uint32_t unit = get(Tag_FP_arch);
  // Values that are not known add nothing to the clean slate above.
  if (unit == 0 || unit >= std::size(Units)) return;
  features |= Units[unit];
  if (get(Tag_ABI_HardFP_use) != 2) features |= HFU_SINGLE;
  if (get(Tag_ABI_HardFP_use) != 1) features |= HFU_DOUBLE;
  if ((unit == 3 || unit == 4) && get(Tag_FP_HP_extension) == 1) features |= FP16;
  if (unit == 8 && get(Tag_CPU_arch) == 14 && get(Tag_Advanced_SIMD_arch) >= 4)
    features |= V81_SIMD;
}

void RecordFromTags::addDsp() {
  FeatureSet& features = m_Record.m_Features;
  const bool passesInIntegers = get(Tag_ABI_HFU_args) != 1;
  features.put(SOFTFP, get(Tag_ABI_FP_number_model) != 0 && passesInIntegers);
  if (get(Tag_DSP_extension) == 1)
    features |= DSP_MULT | V7EM_EXTENSION;
  else if (!getOwnTarget().features.contains(V7EM_EXTENSION))
    features.put(V7EM_EXTENSION, false);
}

void RecordFromTags::addPosition() {
  const uint32_t readWrite = get(Tag_ABI_PCS_RW_data);
  if (!has(Tag_ABI_PCS_RW_data)) return;
  if (get(Tag_ABI_PCS_RO_data) == 1 && readWrite == 1 && get(Tag_ABI_PCS_GOT_use) == 2)
    apply("/norwpi/fpic");
  else if (readWrite == 0 || readWrite == 3)
    apply("/norwpi/nofpic");
  else if (readWrite == 1)
    apply("/norwpi/fpic/noropi/noindirect");
  else if (readWrite == 2 && get(Tag_ABI_PCS_R9_use) == 1)
    apply("/nofpic/rwpi");
}

void RecordFromTags::addAddressing() {
  if (has(Tag_CPU_unaligned_access) && get(Tag_CPU_unaligned_access) <= 1) {
    applyAccessString(m_Record.m_Access, get(Tag_CPU_unaligned_access) == 0
                                             ? "-UL41-US41-UL21-US21"
                                             : "+UL41+US41+UL21+US21");
  }
  addPosition();
  applyEither(Tag_ABI_PCS_RO_data, "/noropi", "/ropi");
  apply(get(Tag_ABI_PCS_GOT_use) == 2 ? "/indirect" : "/noindirect");
  apply(get(Tag_ABI_PCS_R9_use) != 0 ? "/nousev6" : "/usev6");
}

void RecordFromTags::addAlignment() {
  const uint32_t needed = get(Tag_ABI_align_needed);
  apply(needed == 1 ? "/8byte" : "/no8byte");
  if (needed == 2) m_Record.m_Flags |= Flag_Align4;
  putStack8(Stack8_Requires, needed == 1);
  const uint32_t preserved = get(Tag_ABI_align_preserved);
  putStack8(Stack8_Preserves, preserved == 1 || preserved == 2);
  const uint32_t goals = get(Tag_ABI_optimization_goals);
  apply(goals == 1 || goals == 2 ? "-otime" : "-ospace");
}

void RecordFromTags::addFloatingPointModel() {
  const uint32_t model = get(Tag_ABI_FP_number_model);
  m_Record.m_Features.put(PURE_DOUBLES, model != 0);
  if (model == 0) return apply("-noieee_full-noieee_part-noieee_java");
  if (get(Tag_ABI_FP_rounding) == 1) return apply("-noieee_part-noieee_java-ieee_full");
  if (get(Tag_ABI_FP_exceptions) == 1 || model == 3)
    return apply("-noieee_full-noieee_java-ieee_part");
  if (get(Tag_ABI_FP_denormal) == 1) return apply("-noieee_full-noieee_part-ieee_java");
  apply("-noieee_full-noieee_part-noieee_java");
  m_Record.m_Features.put(FZ_POSZERO, get(Tag_ABI_FP_denormal) == 0);
}

void RecordFromTags::addMakersFlags() {
  applyEither(ZevTag::Tag_ZV_interworking, "/interwork", "/nointerwork");
  if (has(ZevTag::Tag_ZV_cpp_exceptions) && get(ZevTag::Tag_ZV_cpp_exceptions) <= 1) {
    m_Record.m_Flags &= ~uint64_t{Flag_Exceptions};
    if (get(ZevTag::Tag_ZV_cpp_exceptions) == 1) m_Record.m_Flags |= Flag_Exceptions;
  }
  applyEither(ZevTag::Tag_ZV_standardlib, "/nostandardlib", "/standardlib");
  applyEither(ZevTag::Tag_ZV_microlib, "/nomicrolib", "/microlib");
  if (has(ZevTag::Tag_ZV_require8) && get(ZevTag::Tag_ZV_require8) <= 1)
    putStack8(Stack8_Requires, get(ZevTag::Tag_ZV_require8) == 0);
  // The maker's tag overrules what the public one has said above.
  if (!has(ZevTag::Tag_ZV_eba) || get(ZevTag::Tag_ZV_eba) > 2) return;
  apply(get(ZevTag::Tag_ZV_eba) == 0 ? "/8byte" : "/no8byte");
  if (get(ZevTag::Tag_ZV_eba) == 2) m_Record.m_Flags |= Flag_Align4;
}

void RecordFromTags::addMakersFeatures() {
  FeatureSet& features = m_Record.m_Features;
  if (has(ZevTag::Tag_ZV_mdivide) && get(ZevTag::Tag_ZV_mdivide) <= 1)
    features.put(MARVELL_DIV, get(ZevTag::Tag_ZV_mdivide) == 1);
  if (has(ZevTag::Tag_ZV_pld)) {
    const uint32_t preload = get(ZevTag::Tag_ZV_pld);
    if (preload == 0)
      features.put(PLD1, false);
    else if (preload <= PreloadsByTag.size())
      features |= PreloadsByTag[preload - 1];
  }
  const bool hasFullIsa = !has(ZevTag::Tag_ZV_full_isa) || get(ZevTag::Tag_ZV_full_isa) == 1;
  if (hasFullIsa && has(Tag_KRELL_ISA_use)) features |= KRELL_ISAv5;
  if (hasFullIsa && has(Tag_ZEV_ISA_use)) features |= ZEV_ISAv8;
}

void RecordFromTags::addDataSizes() {
  if (get(Tag_ABI_enum_size) == 2) m_Record.m_Flags |= Flag_EnumInt;
  if (get(Tag_ABI_PCS_wchar_t) == 4) m_Record.m_Flags |= Flag_WChar32;
}

void BuildAttributes::updateFullAttr() const {
  m_FlagsStale = false;
  m_FullAttr = RecordFromTags(*this).make();
}

void BuildAttributes::applyDefaultPld(FeatureSet& features) const {
  constexpr std::string_view Family = "NCores";
  const bool isOfFamily = getStringTag(Tag_CPU_raw_name).starts_with(Family) ||
                          getStringTag(Tag_CPU_name).starts_with(Family);
  if (!isOfFamily) features = features.without(PLD1);
}

} // namespace elfext
