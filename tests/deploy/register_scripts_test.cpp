// tvr-register-sfcb and tvr-register-pegasus, run against stand-ins for the
// object managers' tools that record how they were called: which files they
// get, in which namespaces and in which order.
#include "StagedInstall.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

#include <fstream>
#include <sstream>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

const std::string kSfcbScript = TVR_SOURCE_DIR "/deploy/sfcb/tvr-register-sfcb";
const std::string kPegasusScript = TVR_SOURCE_DIR "/deploy/pegasus/tvr-register-pegasus";

void writeFile(const std::string& path, const std::string& text, mode_t mode = 0644) {
  std::ofstream(path) << text;
  chmod(path.c_str(), mode);
}

std::vector<std::string> linesOf(const std::string& path) {
  std::ifstream in(path);
  std::vector<std::string> lines;
  std::string line;
  while (std::getline(in, line)) lines.push_back(line);
  return lines;
}

/// A scratch directory with recording stand-ins for sfcbstage, sfcbunstage,
/// sfcbrepos, cimmof and cimprovider, and a share directory of the files
/// the scripts register.
class RegisterScriptsTest : public ::testing::Test {
protected:
  void SetUp() override {
    char dir[] = "/tmp/tvr-register-XXXXXX";
    ASSERT_NE(mkdtemp(dir), nullptr);
    dir_ = dir;
    mkdir((dir_ + "/bin").c_str(), 0755);
    for (const char* tool : {"sfcbstage", "sfcbunstage", "sfcbrepos", "cimmof", "cimprovider"})
      standIn(tool, 0);
    share_ = dir_ + "/share";
    mkdir(share_.c_str(), 0755);
    mkdir((share_ + "/sfcb").c_str(), 0755);
    mkdir((share_ + "/pegasus").c_str(), 0755);
    writeFile(share_ + "/TVRHX_PhysicalAsset.mof", "// classes\n");
    writeFile(share_ + "/sfcb/tvrhx-physical-asset.reg", "# registration\n");
    writeFile(share_ + "/pegasus/TVRHX_PhysicalAssetRegistration.mof",
              "instance of PG_ProviderModule\n{\n   Name = \"TVRPhysicalAssetProviderModule\";\n};\n"
              "instance of PG_Provider\n{\n   Name = \"ChassisProvider\";\n};\n");
    writeFile(dir_ + "/sfcb.cfg", "providerDirs: /usr/lib/sfcb /opt/tvr/platform/lib\n");
  }
  void TearDown() override { removeTree(dir_); }

  /// Makes `tool` record its call and exit with `status`.
  void standIn(const std::string& tool, int status) {
    writeFile(dir_ + "/bin/" + tool,
              "#!/bin/sh\necho \"$(basename \"$0\") $*\" >> \"" + dir_ + "/calls\"\nexit " + std::to_string(status) +
                  "\n",
              0755);
  }
  void addCompanionFiles() {
    writeFile(share_ + "/TVRHX_Companion.mof", "// companion classes\n");
    writeFile(share_ + "/sfcb/tvrhx-companion.reg", "# companion registration\n");
    writeFile(share_ + "/pegasus/TVRHX_CompanionRegistration.mof",
              "instance of PG_ProviderModule\n{\n   Name = \"FixCompanionModule\";\n};\n");
  }

  CommandResult run(const std::string& script, const std::vector<std::string>& args = {},
                    bool withShareDir = true) {
    std::vector<std::string> env = withVariable(currentEnvironment(), "PATH", dir_ + "/bin:/usr/bin:/bin");
    env = withVariable(env, "SFCB_CONFIG", dir_ + "/sfcb.cfg");
    env = withoutVariable(env, "TVR_NAMESPACE");
    env = withoutVariable(env, "TVR_INTEROP_NAMESPACE");
    env = withShareDir ? withVariable(env, "TVR_SHARE_DIR", share_) : withoutVariable(env, "TVR_SHARE_DIR");
    std::vector<std::string> argv = {script};
    argv.insert(argv.end(), args.begin(), args.end());
    return runCommand(argv, env);
  }
  std::vector<std::string> calls() const { return linesOf(dir_ + "/calls"); }

  std::string dir_;
  std::string share_;
};

TEST_F(RegisterScriptsTest, SfcbRegistrationStagesClassesWithRegistrationThenRebuildsTheRepository) {
  const CommandResult r = run(kSfcbScript);
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(calls(), ElementsAre("sfcbstage -n root/cimv2 -r " + share_ + "/sfcb/tvrhx-physical-asset.reg " +
                                       share_ + "/TVRHX_PhysicalAsset.mof",
                                   "sfcbrepos -f"));
  EXPECT_THAT(r.out, HasSubstr("Restart SFCB"));
}

TEST_F(RegisterScriptsTest, SfcbRegistrationStagesTheCompanionClassesFirst) {
  addCompanionFiles();
  const CommandResult r = run(kSfcbScript);
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(calls(), ElementsAre("sfcbstage -n root/cimv2 -r " + share_ + "/sfcb/tvrhx-companion.reg " + share_ +
                                       "/TVRHX_Companion.mof",
                                   "sfcbstage -n root/cimv2 -r " + share_ + "/sfcb/tvrhx-physical-asset.reg " +
                                       share_ + "/TVRHX_PhysicalAsset.mof",
                                   "sfcbrepos -f"));
}

TEST_F(RegisterScriptsTest, SfcbRegistrationWithoutCompanionStagesOnlyThePhysicalAssetClasses) {
  addCompanionFiles();
  const CommandResult r = run(kSfcbScript, {"--no-companion"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(calls(), ElementsAre("sfcbstage -n root/cimv2 -r " + share_ + "/sfcb/tvrhx-physical-asset.reg " +
                                       share_ + "/TVRHX_PhysicalAsset.mof",
                                   "sfcbrepos -f"));
}

TEST_F(RegisterScriptsTest, SfcbRemovalUnstagesByFileNameThenRebuildsTheRepository) {
  const CommandResult r = run(kSfcbScript, {"--remove"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(calls(), ElementsAre("sfcbunstage -n root/cimv2 -r tvrhx-physical-asset.reg TVRHX_PhysicalAsset.mof",
                                   "sfcbrepos -f"));
}

TEST_F(RegisterScriptsTest, SfcbRegistrationUsesTheNamespaceGiven) {
  std::vector<std::string> env = withVariable(currentEnvironment(), "PATH", dir_ + "/bin:/usr/bin:/bin");
  env = withVariable(env, "TVR_SHARE_DIR", share_);
  env = withVariable(env, "SFCB_CONFIG", dir_ + "/sfcb.cfg");
  env = withVariable(env, "TVR_NAMESPACE", "root/tvr");
  ASSERT_EQ(runCommand({kSfcbScript}, env).exitStatus, 0);
  EXPECT_THAT(calls().at(0), HasSubstr("sfcbstage -n root/tvr -r "));
}

TEST_F(RegisterScriptsTest, SfcbRegistrationSaysWhenSfcbDoesNotLookInThePlatformDirectory) {
  writeFile(dir_ + "/sfcb.cfg", "providerDirs: /usr/lib/sfcb\n");
  const CommandResult r = run(kSfcbScript);
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.err, HasSubstr("add /opt/tvr/platform/lib to providerDirs in " + dir_ + "/sfcb.cfg"));
}

TEST_F(RegisterScriptsTest, SfcbRegistrationIsQuietWhenSfcbLooksInThePlatformDirectory) {
  const CommandResult r = run(kSfcbScript);
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.err, IsEmpty());
}

TEST_F(RegisterScriptsTest, SfcbRegistrationStopsWhenStagingFails) {
  standIn("sfcbstage", 3);
  const CommandResult r = run(kSfcbScript);
  EXPECT_NE(r.exitStatus, 0);
  EXPECT_THAT(calls(), ElementsAre(HasSubstr("sfcbstage ")));
}

TEST_F(RegisterScriptsTest, PegasusRegistrationCompilesClassesThenTheRegistration) {
  const CommandResult r = run(kPegasusScript);
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(calls(), ElementsAre("cimmof -n root/cimv2 " + share_ + "/TVRHX_PhysicalAsset.mof",
                                   "cimmof -n root/PG_InterOp " + share_ + "/pegasus/TVRHX_PhysicalAssetRegistration.mof"));
  EXPECT_THAT(r.out, HasSubstr("/opt/tvr/platform/lib"));
}

TEST_F(RegisterScriptsTest, PegasusRegistrationCompilesTheCompanionFirst) {
  addCompanionFiles();
  const CommandResult r = run(kPegasusScript);
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(calls(), ElementsAre("cimmof -n root/cimv2 " + share_ + "/TVRHX_Companion.mof",
                                   "cimmof -n root/PG_InterOp " + share_ + "/pegasus/TVRHX_CompanionRegistration.mof",
                                   "cimmof -n root/cimv2 " + share_ + "/TVRHX_PhysicalAsset.mof",
                                   "cimmof -n root/PG_InterOp " + share_ + "/pegasus/TVRHX_PhysicalAssetRegistration.mof"));
}

TEST_F(RegisterScriptsTest, PegasusRegistrationWithoutCompanionCompilesOnlyThePhysicalAssetFiles) {
  addCompanionFiles();
  const CommandResult r = run(kPegasusScript, {"--no-companion"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(calls(), ElementsAre("cimmof -n root/cimv2 " + share_ + "/TVRHX_PhysicalAsset.mof",
                                   "cimmof -n root/PG_InterOp " + share_ + "/pegasus/TVRHX_PhysicalAssetRegistration.mof"));
}

TEST_F(RegisterScriptsTest, PegasusRemovalDeletesTheProviderModules) {
  addCompanionFiles();
  const CommandResult r = run(kPegasusScript, {"--remove"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(calls(), ElementsAre("cimprovider -r -m FixCompanionModule",
                                   "cimprovider -r -m TVRPhysicalAssetProviderModule"));
}

TEST_F(RegisterScriptsTest, ScriptsRefuseOtherArguments) {
  for (const std::string& script : {kSfcbScript, kPegasusScript}) {
    const CommandResult r = run(script, {"--force"});
    EXPECT_EQ(r.exitStatus, 1) << script;
    EXPECT_THAT(r.err, HasSubstr("usage: ")) << script;
  }
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(RegisterScriptsTest, ScriptsStopWithoutTheRegistrationFiles) {
  std::remove((share_ + "/TVRHX_PhysicalAsset.mof").c_str());
  for (const std::string& script : {kSfcbScript, kPegasusScript}) {
    const CommandResult r = run(script);
    EXPECT_EQ(r.exitStatus, 1) << script;
    EXPECT_THAT(r.err, HasSubstr("no registration files in " + share_)) << script;
  }
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(RegisterScriptsTest, InstalledScriptsFindTheInstalledFilesBesideThemselves) {
  const StagedInstall& install = StagedInstall::get();
  ASSERT_EQ(install.result().exitStatus, 0) << install.result().err;
  const std::string share = install("/usr/share/tvr-physical-asset");

  CommandResult r = run(install("/usr/sbin/tvr-register-sfcb"), {}, false);
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(calls(), ::testing::Contains("sfcbstage -n root/cimv2 -r " + share + "/sfcb/tvrhx-physical-asset.reg " +
                                           share + "/TVRHX_PhysicalAsset.mof"));
  EXPECT_EQ(calls().back(), "sfcbrepos -f");

  r = run(install("/usr/sbin/tvr-register-pegasus"), {}, false);
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(calls(), ::testing::Contains("cimmof -n root/PG_InterOp " + share +
                                           "/pegasus/TVRHX_PhysicalAssetRegistration.mof"));
}

} // namespace
} // namespace tvr::test
