#include "device/Packages.h"
#include "support/TemporaryDevice.h"

#include <gtest/gtest.h>

namespace {

class Label : public testing::Test {
protected:
    device::Package packageWith(const std::string& labels) const {
        support::writeFile(folder.path() / "tizen-manifest.xml",
                           "<manifest package='com.example.tea'><ui-application appid='com.example.tea'>" + labels +
                               "</ui-application></manifest>");
        return device::readManifest(folder.path());
    }

    support::TemporaryFolder folder;
};

TEST_F(Label, IsThatOfTheLanguageAndItsCountry) {
    const device::Package package = packageWith("<label xml:lang='ko-kr'> 차 </label><label xml:lang='zh-CN'>茶</label>"
                                                "<label>Tea</label><label xml:lang='de'>Tee</label>");
    EXPECT_EQ(package.labelIn("ko_KR"), "차");
    EXPECT_EQ(package.labelIn("zh_CN"), "茶");
    EXPECT_EQ(package.labelIn("en_US"), "Tea");
    EXPECT_EQ(package.labelIn(""), "Tea");
}

TEST_F(Label, IsThatOfTheLanguageWhereNoneIsTheCountrys) {
    const device::Package package =
        packageWith("<label>Tea</label><label xml:lang='de'>Tee</label><label xml:lang='de-at'>Jause</label>"
                    "<label xml:lang='zh-cn'>茶</label>");
    EXPECT_EQ(package.labelIn("de_DE"), "Tee");
    EXPECT_EQ(package.labelIn("de_AT"), "Jause");
    EXPECT_EQ(package.labelIn("zh_TW"), "Tea");
}

TEST_F(Label, IsTheFirstOfSeveralThatIsNotEmpty) {
    const device::Package package = packageWith("<label> </label><label>Tea</label><label>Cup</label>"
                                                "<label xml:lang='ko-kr'/><label xml:lang='ko-kr'>차</label>");
    EXPECT_EQ(package.labelIn("en_US"), "Tea");
    EXPECT_EQ(package.labelIn("ko_KR"), "차");
}

TEST_F(Label, IsTheIdWhereThereIsNone) {
    EXPECT_EQ(packageWith("<label xml:lang='ko-kr'>차</label>").labelIn("en_US"), "com.example.tea");
}

}  // namespace
