// SPDX-License-Identifier: Apache-2.0
//
// The banner and the version number, also in the forms that this build doesn't have: the data are
// an argument, so that an engineering release and missing or odd parts can be shown.

#include "support/interface/version_banner.h"

#include <gtest/gtest.h>

namespace support {

namespace {

BuildData exampleData() {
  BuildData data{.productName = "Example Tools 2.3",
                 .componentName = "Example Tools 2.3 (beta)",
                 .version = "2.3.4",
                 .delivery = "56"};
  data.buildStamp = 0xAB;
  return data;
}

BuildData engineeringData() {
  BuildData data = exampleData();
  data.isEngineeringRelease = true;
  return data;
}

std::string componentLine(const BuildData& data) {
  const std::string text = bannerText(data);
  const size_t start = text.find("\nComponent: ") + 12;
  return text.substr(start, text.find('\n', start) - start);
}

} // namespace

TEST(Banner, OfThisBuildNamesProductComponentAndTool) {
  BuildData data = getBuildData();
  data.buildStamp = 0x01000001;
  EXPECT_EQ(bannerText(data), "Product: Quarn Object Tools 1.0\n"
                              "Component: Quarn Object Tools 1.0\n"
                              "Tool: quarn [01000001]");
}

TEST(Banner, ShowsTheStampWithEightDigits) {
  EXPECT_EQ(bannerText(exampleData()), "Product: Example Tools 2.3\n"
                                       "Component: Example Tools 2.3 (beta)\n"
                                       "Tool: quarn [000000ab]");
}

TEST(Banner, OfAnEngineeringReleaseWarnsAndShowsTheFullComponent) {
  EXPECT_EQ(bannerText(engineeringData()), "Product: Example Tools 2.3\n"
                                           "Component: Example Tools 2.3.0.56 (beta)\n"
                                           "Tool: quarn [000000ab]\n"
                                           "Engineering release. Not for production use.");
}

TEST(Banner, PutsTheLabelBehindTheDelivery) {
  BuildData data = engineeringData();
  data.developmentLabel = "trunk";
  EXPECT_EQ(componentLine(data), "Example Tools 2.3.0.56 trunk (beta)");
}

TEST(Banner, AddsNoPatchToAFullVersion) {
  BuildData data = engineeringData();
  data.componentName = "Example Tools 2.3.4";
  EXPECT_EQ(componentLine(data), "Example Tools 2.3.4.56");
  data.componentName = "Example Tools 2.34";
  EXPECT_EQ(componentLine(data), "Example Tools 2.34.0.56");
}

TEST(Banner, EndsWithTheFurtherLinesOfTheBuild) {
  BuildData data = exampleData();
  data.furtherLine = "For evaluation only.";
  data.supplier = "Example Works";
  EXPECT_TRUE(bannerText(data).ends_with("[000000ab]\nFor evaluation only.\n"
                                         "Software supplied by: Example Works"));
}

TEST(Banner, LosesOneTrailingBlank) {
  BuildData data = exampleData();
  data.supplier = "Example Works  ";
  EXPECT_TRUE(bannerText(data).ends_with("Example Works "));
}

TEST(VersionNumber, OfThisBuildIsOneNumber) {
  EXPECT_EQ(versionNumberText(getBuildData()), "1000001");
}

TEST(VersionNumber, GivesTwoDigitsToAllButTheMajorPart) {
  EXPECT_EQ(versionNumberText(exampleData()), "2030456");
  BuildData data = exampleData();
  data.version = "12.34.99";
  EXPECT_EQ(versionNumberText(data), "12349956");
}

TEST(VersionNumber, CountsAPatchAbove99AsZero) {
  BuildData data = exampleData();
  data.version = "2.3.100";
  EXPECT_EQ(versionNumberText(data), "2030056");
}

TEST(VersionNumber, CountsADeliveryThatIsNoNumberAsZero) {
  BuildData data = exampleData();
  for (const char* delivery : {"5x", "x", "", "-1"}) {
    data.delivery = delivery;
    EXPECT_EQ(versionNumberText(data), "2030400") << delivery;
  }
}

TEST(VersionNumber, CountsMissingPartsAsZero) {
  BuildData data = exampleData();
  data.version = "";
  EXPECT_EQ(versionNumberText(data), "0000056");
  data.version = "2.3";
  EXPECT_EQ(versionNumberText(data), "2030056");
}

} // namespace support
