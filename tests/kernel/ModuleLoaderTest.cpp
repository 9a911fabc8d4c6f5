#include <gtest/gtest.h>

#include "TempDir.h"
#include "TestInterfaces.h"
#include "VORExtensionRegistry.h"
#include "VORModuleLoader.h"

namespace {

class PlainObject : public VORBaseUnknown {
  VOR_DECLARE_CLASS(PlainObject, VORBaseUnknown)
 public:
  explicit PlainObject(const char* type) : _type(type) {}
  const char* GetLateType() const override { return _type; }

 private:
  const char* _type;
};

// First: it must be the one that loads the module.
TEST(ModuleLoaderTest, DictionaryLoadsTheModuleThatProvidesAnExtension) {
  TempDir dir;
  const std::string dic = dir.Write("VORModules.dic",
                                    "# late type   interface            module\n"
                                    "TestModuleType ITestModuleProvided KernelTestGoodModule\n"
                                    "OtherType ITestModuleProvided NoSuchModule\n");
  ASSERT_TRUE(VORExtensionRegistry::LoadDictionary(dic));
  VORBaseUnknown_var provided = VORBaseUnknown_var::Adopt(new PlainObject("TestModuleType"));
  ITestModuleProvided_var answer(provided);
  ASSERT_TRUE(answer);
  EXPECT_EQ(answer->Answer(), 42);
  // A dictionary entry naming a missing module is a quiet null.
  VORBaseUnknown_var other = VORBaseUnknown_var::Adopt(new PlainObject("OtherType"));
  EXPECT_FALSE(ITestModuleProvided_var(other));
  VORExtensionRegistry::ClearDictionary();
  EXPECT_FALSE(VORExtensionRegistry::LoadDictionary(dir.Path() + "/missing.dic"));
}

TEST(ModuleLoaderTest, CreatesAClassOfAModuleByName) {
  VORBaseUnknown* made = VORModuleLoader::CreateObject("KernelTestGoodModule", "ModuleWidget");
  ASSERT_NE(made, nullptr) << VORModuleLoader::LastError();
  ITestShape_var shape = ITestShape_var(VORBaseUnknown_var::Adopt(made));
  ASSERT_TRUE(shape);
  EXPECT_EQ(shape->Corners(), 5);
}

TEST(ModuleLoaderTest, UnknownModuleOrClassGivesNullAndSaysWhy) {
  EXPECT_EQ(VORModuleLoader::CreateObject("NoSuchModule", "Anything"), nullptr);
  EXPECT_NE(VORModuleLoader::LastError().find("NoSuchModule"), std::string::npos);
  EXPECT_EQ(VORModuleLoader::CreateObject("KernelTestGoodModule", "NoSuchClass"), nullptr);
  EXPECT_NE(VORModuleLoader::LastError().find("fctCreateNoSuchClass"), std::string::npos);
  EXPECT_EQ(VORModuleLoader::CreateObject("KernelTestNoFactoryModule", "ModuleWidget"), nullptr);
  EXPECT_EQ(VORModuleLoader::CreateObject("../etc/passwd", "X"), nullptr);
  EXPECT_EQ(VORModuleLoader::CreateObject("KernelTestGoodModule", ""), nullptr);
}

}  // namespace
