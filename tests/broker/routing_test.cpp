// Which provider a request goes to, what it is handed, and how the answers
// of several providers are merged.
#include "BrokerTestSupport.h"

namespace tvr::broker::test {
namespace {

using RoutingTest = TestProviderTest;

AssociationArgs withAssocClass(const std::string& assocClass) {
  AssociationArgs args;
  args.assocClass = assocClass;
  return args;
}

AssociationArgs withResultClass(const std::string& resultClass) {
  AssociationArgs args;
  args.resultClass = resultClass;
  return args;
}

TEST_F(RoutingTest, RegisteredClassReachesItsProvider) {
  const Response r = om.enumerateInstanceNames(classPath("TVR_AllTypes"));
  EXPECT_TRUE(r.ok()) << statusName(r.rc);
  ASSERT_EQ(r.outcomes.size(), 1u);
  EXPECT_EQ(r.outcomes[0].provider, "TestInstanceProvider");
  EXPECT_EQ(r.outcomes[0].className, "TVR_AllTypes");
  EXPECT_EQ(r.operation, Operation::EnumerateInstanceNames);
  EXPECT_EQ(r.paths().size(), 2u);
}

TEST_F(RoutingTest, ClassIsLookedUpWithoutRegardToCase) {
  const Response r = om.enumerateInstanceNames(classPath("tvr_alltypes"));
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.outcomes.size(), 1u);
  EXPECT_EQ(r.outcomes[0].className, "TVR_AllTypes");
}

TEST_F(RoutingTest, UnregisteredClassIsAnInvalidClass) {
  const Response r = om.enumerateInstances(classPath("TVR_Unregistered"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_INVALID_CLASS);
  EXPECT_EQ(r.message, "no provider is registered for class TVR_Unregistered");
  EXPECT_TRUE(r.outcomes.empty());
  EXPECT_TRUE(r.items.empty());
}

TEST_F(RoutingTest, NamespaceTheClassIsNotRegisteredInIsAnInvalidNamespace) {
  const Response r = om.getInstance(keyedPath("TVR_AllTypes", {{"Name", "one"}}, "root/cimv2"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_INVALID_NAMESPACE);
  EXPECT_EQ(r.message, "class TVR_AllTypes is not registered in namespace root/cimv2");
  EXPECT_TRUE(r.outcomes.empty());
}

TEST_F(RoutingTest, ClassRegisteredInSeveralNamespacesIsServedInEach) {
  for (const char* ns : {"root/tvrtest", "root/second"}) {
    const Response r = om.getInstance(keyedPath("TVR_Echo", {{"Id", "x"}}, ns));
    EXPECT_TRUE(r.ok()) << ns;
    ASSERT_EQ(r.instances().size(), 1u) << ns;
    EXPECT_EQ(r.instances()[0].path.nameSpace, ns);
  }
}

TEST_F(RoutingTest, NamespaceIsComparedWithoutRegardToCase) {
  EXPECT_TRUE(om.enumerateInstanceNames(classPath("TVR_AllTypes", "ROOT/TvrTest")).ok());
}

TEST_F(RoutingTest, RouteToChoosesTheRegistrationButHandsTheRequestOverUnchanged) {
  RequestOptions options;
  options.routeTo = "TVR_AllTypes";
  const Response r = om.enumerateInstances(classPath("TVR_Unregistered"), std::nullopt, options);
  ASSERT_EQ(r.outcomes.size(), 1u);
  EXPECT_EQ(r.outcomes[0].className, "TVR_AllTypes");
  // The provider saw the request's own class, which it does not serve.
  EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(r.message, "TestInstanceProvider does not serve TVR_Unregistered");
}

TEST_F(RoutingTest, RouteToAnUnregisteredClassIsAnInvalidClass) {
  RequestOptions options;
  options.routeTo = "TVR_Nowhere";
  const Response r = om.enumerateInstances(classPath("TVR_AllTypes"), std::nullopt, options);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_INVALID_CLASS);
  EXPECT_TRUE(r.outcomes.empty());
}

TEST_F(RoutingTest, RouteToAppliesToAssociationRequestsToo) {
  RequestOptions options;
  options.routeTo = "TVR_OtherAssociation";
  const Response r = om.associatorNames(classPath("TVR_Source"), withAssocClass("TVR_EchoAssociation"), options);
  ASSERT_EQ(r.outcomes.size(), 1u);
  EXPECT_EQ(r.outcomes[0].provider, "OtherAssociationProvider");
  EXPECT_EQ(dataTexts(r), std::vector<std::string>{"Other associatorNames assocClass=TVR_EchoAssociation "
                                                   "resultClass=NULL role=NULL resultRole=NULL properties=NULL"});
}

TEST_F(RoutingTest, AssociationRequestWithoutAssocClassGoesToEveryAssociationProviderInFileOrder) {
  const Response r = om.associatorNames(classPath("TVR_Source"), AssociationArgs{});
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.outcomes.size(), 2u);
  EXPECT_EQ(r.outcomes[0].provider, "EchoAssociationProvider");
  EXPECT_EQ(r.outcomes[0].className, "TVR_EchoAssociation");
  EXPECT_EQ(r.outcomes[1].provider, "OtherAssociationProvider");
  EXPECT_EQ(r.outcomes[1].className, "TVR_OtherAssociation");
  EXPECT_EQ(dataTexts(r),
            (std::vector<std::string>{
                "Echo associatorNames assocClass=NULL resultClass=NULL role=NULL resultRole=NULL properties=NULL",
                "Other associatorNames assocClass=NULL resultClass=NULL role=NULL resultRole=NULL properties=NULL"}));
  EXPECT_EQ(r.doneCount, 2);
}

TEST_F(RoutingTest, OwnClassForEachProviderHandsEachProviderItsAssociationClass) {
  RequestOptions options;
  options.ownClassForEachProvider = true;
  const Response r = om.associators(classPath("TVR_Source"), AssociationArgs{}, options);
  EXPECT_EQ(dataTexts(r), (std::vector<std::string>{
                              "Echo associators assocClass=TVR_EchoAssociation resultClass=NULL role=NULL "
                              "resultRole=NULL properties=NULL",
                              "Other associators assocClass=TVR_OtherAssociation resultClass=NULL role=NULL "
                              "resultRole=NULL properties=NULL"}));
}

TEST_F(RoutingTest, OwnClassForEachProviderFillsTheResultClassOfReferences) {
  RequestOptions options;
  options.ownClassForEachProvider = true;
  const Response r = om.referenceNames(classPath("TVR_Source"), AssociationArgs{}, options);
  EXPECT_EQ(dataTexts(r), (std::vector<std::string>{
                              "Echo referenceNames resultClass=TVR_EchoAssociation role=NULL properties=NULL",
                              "Other referenceNames resultClass=TVR_OtherAssociation role=NULL properties=NULL"}));
}

TEST_F(RoutingTest, AssocClassSelectsItsProviderOnly) {
  const Response r = om.associators(classPath("TVR_Source"), withAssocClass("tvr_otherassociation"));
  ASSERT_EQ(r.outcomes.size(), 1u);
  EXPECT_EQ(r.outcomes[0].provider, "OtherAssociationProvider");
  EXPECT_EQ(dataTexts(r), std::vector<std::string>{"Other associators assocClass=tvr_otherassociation "
                                                   "resultClass=NULL role=NULL resultRole=NULL properties=NULL"});
}

TEST_F(RoutingTest, ResultClassOfReferencesSelectsItsProviderOnly) {
  const Response r = om.references(classPath("TVR_Source"), withResultClass("TVR_EchoAssociation"));
  ASSERT_EQ(r.outcomes.size(), 1u);
  EXPECT_EQ(r.outcomes[0].provider, "EchoAssociationProvider");
}

TEST_F(RoutingTest, UnknownAssocClassIsAnInvalidClass) {
  const Response r = om.associatorNames(classPath("TVR_Source"), withAssocClass("TVR_NoSuchAssociation"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_INVALID_CLASS);
  EXPECT_EQ(r.message, "no association provider is registered for class TVR_NoSuchAssociation");
}

TEST_F(RoutingTest, AssocClassWithOnlyAnInstanceProviderIsAnInvalidClass) {
  const Response r = om.associators(classPath("TVR_Source"), withAssocClass("TVR_Echo"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_INVALID_CLASS);
  EXPECT_TRUE(r.outcomes.empty());
}

// A result class of references need not be an association class the table
// knows (it may name a superclass), so it does not narrow the request.
TEST_F(RoutingTest, UnknownResultClassOfReferencesGoesToEveryAssociationProvider) {
  const Response r = om.referenceNames(classPath("TVR_Source"), withResultClass("CIM_Dependency"));
  ASSERT_EQ(r.outcomes.size(), 2u);
  EXPECT_EQ(dataTexts(r)[0], "Echo referenceNames resultClass=CIM_Dependency role=NULL properties=NULL");
}

TEST_F(RoutingTest, AssociationRequestInANamespaceWithoutAssociationProvidersIsAnInvalidNamespace) {
  const Response r = om.associatorNames(classPath("TVR_Source", "root/second"), AssociationArgs{});
  EXPECT_EQ(r.rc, CMPI_RC_ERR_INVALID_NAMESPACE);
  EXPECT_EQ(r.message, "no association provider is registered in namespace root/second");
}

TEST_F(RoutingTest, AssociationArgumentsPassThroughUnchanged) {
  AssociationArgs args;
  args.assocClass = "TVR_EchoAssociation";
  args.resultClass = "TVR_Result";
  args.role = "Antecedent";
  args.resultRole = "Dependent";
  args.properties = std::vector<std::string>{"Name", "Size"};
  EXPECT_EQ(dataTexts(om.associators(classPath("TVR_Source"), args)),
            std::vector<std::string>{"Echo associators assocClass=TVR_EchoAssociation resultClass=TVR_Result "
                                     "role=Antecedent resultRole=Dependent properties=[Name,Size]"});
  EXPECT_EQ(dataTexts(om.associatorNames(classPath("TVR_Source"), args)),
            std::vector<std::string>{"Echo associatorNames assocClass=TVR_EchoAssociation resultClass=TVR_Result "
                                     "role=Antecedent resultRole=Dependent properties=NULL"});
  args.resultClass = "TVR_EchoAssociation";
  EXPECT_EQ(dataTexts(om.references(classPath("TVR_Source"), args)),
            std::vector<std::string>{
                "Echo references resultClass=TVR_EchoAssociation role=Antecedent properties=[Name,Size]"});
  EXPECT_EQ(dataTexts(om.referenceNames(classPath("TVR_Source"), args)),
            std::vector<std::string>{
                "Echo referenceNames resultClass=TVR_EchoAssociation role=Antecedent properties=NULL"});
}

TEST_F(RoutingTest, EmptyPropertyListIsPassedAsAnEmptyListNotAsNull) {
  AssociationArgs args = withAssocClass("TVR_EchoAssociation");
  args.properties = std::vector<std::string>{};
  EXPECT_EQ(dataTexts(om.associators(classPath("TVR_Source"), args)),
            std::vector<std::string>{"Echo associators assocClass=TVR_EchoAssociation resultClass=NULL role=NULL "
                                     "resultRole=NULL properties=[]"});
}

TEST_F(RoutingTest, MergedStatusIsOkWhenOneProviderSucceeds) {
  const Response r = om.associatorNames(classPath("TVR_FailInOther"), AssociationArgs{});
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_FALSE(r.message);
  ASSERT_EQ(r.outcomes.size(), 2u);
  EXPECT_EQ(r.outcomes[0].rc, CMPI_RC_OK);
  EXPECT_EQ(r.outcomes[1].rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_EQ(r.outcomes[1].message, "Other found nothing");
  EXPECT_EQ(dataTexts(r).size(), 1u);
}

TEST_F(RoutingTest, MergedStatusIsOkWhenOnlyTheFirstProviderFails) {
  const Response r = om.associatorNames(classPath("TVR_FailInEcho"), AssociationArgs{});
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.outcomes[0].rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_EQ(r.outcomes[1].rc, CMPI_RC_OK);
}

TEST_F(RoutingTest, MergedStatusIsTheFirstFailureWhenEveryProviderFails) {
  const Response r = om.associatorNames(classPath("TVR_FailEverywhere"), AssociationArgs{});
  EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_EQ(r.message, "Echo found nothing");
  ASSERT_EQ(r.outcomes.size(), 2u);
  EXPECT_EQ(r.outcomes[1].message, "Other found nothing");
}

TEST_F(RoutingTest, SingleProviderStatusAndMessageBecomeTheResponses) {
  const Response r = om.associatorNames(classPath("TVR_FailInEcho"), withAssocClass("TVR_EchoAssociation"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_EQ(r.message, "Echo found nothing");
}

TEST_F(RoutingTest, MissingLibraryFailsNamingTheLibraryAndWhereItWasSought) {
  const Response r = om.enumerateInstances(classPath("TVR_MissingLibrary", "root/broken"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, "provider library libtvrbrokerabsentlibrary.so not found (searched: " +
                           testProviderDirectory() + ")");
  ASSERT_EQ(r.outcomes.size(), 1u);
  EXPECT_EQ(r.outcomes[0].provider, "StrayProvider");
  EXPECT_EQ(r.outcomes[0].rc, CMPI_RC_ERR_FAILED);
}

TEST_F(RoutingTest, MissingInstanceEntryPointFailsNamingIt) {
  const Response r = om.enumerateInstanceNames(classPath("TVR_MissingEntryPoint", "root/broken"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, "libtvrbrokertestprovider.so has no entry point AbsentProvider_Create_InstanceMI");
}

TEST_F(RoutingTest, MissingAssociationEntryPointFailsNamingIt) {
  const Response r = om.references(classPath("TVR_Source", "root/broken"), AssociationArgs{});
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, "libtvrbrokertestprovider.so has no entry point AbsentProvider_Create_AssociationMI");
}

TEST_F(RoutingTest, InstanceRequestToAnAssociationOnlyClassFails) {
  const Response r = om.enumerateInstances(classPath("TVR_EchoAssociation"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, "class TVR_EchoAssociation has no instance provider");
}

TEST_F(RoutingTest, ExplicitLibraryFileIsUsedBeforeTheDirectories) {
  ObjectManagerOptions options = testProviderOptions();
  options.providerDirectories.clear();
  options.libraryFiles["tvrbrokertestprovider"] = testProviderDirectory() + "/libtvrbrokertestprovider.so";
  ObjectManager explicitFile(std::move(options));
  EXPECT_TRUE(explicitFile.enumerateInstanceNames(classPath("TVR_AllTypes")).ok());
}

TEST_F(RoutingTest, LibraryThatCannotBeLoadedFailsWithTheLoadersMessage) {
  ObjectManagerOptions options = testProviderOptions();
  options.libraryFiles["tvrbrokertestprovider"] = testRegistrationFile(); // not a shared object
  ObjectManager wrongFile(std::move(options));
  const Response r = wrongFile.enumerateInstanceNames(classPath("TVR_AllTypes"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  ASSERT_TRUE(r.message);
  EXPECT_EQ(r.message->rfind("cannot load provider library " + testRegistrationFile() + ": ", 0), 0u) << *r.message;
}

TEST_F(RoutingTest, InstanceMIIsTheOneTheEntryPointMade) {
  std::string error;
  CMPIInstanceMI* mi = om.instanceMI("TestInstanceProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  EXPECT_STREQ(mi->ft->miName, "instanceTestInstanceProvider");
  EXPECT_EQ(om.instanceMI("TestInstanceProvider"), mi);
  CMPIAssociationMI* assoc = om.associationMI("EchoAssociationProvider", &error);
  ASSERT_NE(assoc, nullptr) << error;
  EXPECT_STREQ(assoc->ft->miName, "associationEchoAssociationProvider");
}

TEST_F(RoutingTest, MIOfAnUnregisteredProviderIsNullWithAReason) {
  std::string error;
  EXPECT_EQ(om.instanceMI("NoSuchProvider", &error), nullptr);
  EXPECT_EQ(error, "provider NoSuchProvider is not registered");
  EXPECT_EQ(om.associationMI("TestInstanceProvider", &error), nullptr);
  EXPECT_EQ(error, "libtvrbrokertestprovider.so has no entry point TestInstanceProvider_Create_AssociationMI");
}

TEST_F(RoutingTest, ProviderSymbolLooksInTheRegisteredLibrary) {
  std::string error;
  EXPECT_NE(om.providerSymbol("TestInstanceProvider", "TestInstanceProvider_Create_InstanceMI", &error), nullptr);
  EXPECT_EQ(om.providerSymbol("TestInstanceProvider", "tvrNoSuchSymbol", &error), nullptr);
  EXPECT_EQ(error, "symbol tvrNoSuchSymbol not found in libtvrbrokertestprovider.so");
  EXPECT_EQ(om.providerSymbol("NoSuchProvider", "x", &error), nullptr);
  EXPECT_EQ(error, "provider NoSuchProvider is not registered");
}

TEST(ProviderCleanup, ObjectManagerCallsEachMIsCleanupOnceWhenItEnds) {
  int* cleanups = nullptr;
  int* terminating = nullptr;
  int before = 0;
  {
    ObjectManager om(testProviderOptions());
    ASSERT_TRUE(om.enumerateInstanceNames(classPath("TVR_AllTypes")).ok());
    ASSERT_TRUE(om.enumerateInstances(classPath("TVR_Echo")).ok());
    cleanups = static_cast<int*>(om.providerSymbol("TestInstanceProvider", "tvrTestInstanceCleanups"));
    terminating = static_cast<int*>(om.providerSymbol("TestInstanceProvider", "tvrTestLastTerminating"));
    ASSERT_NE(cleanups, nullptr);
    ASSERT_NE(terminating, nullptr);
    before = *cleanups;
    *terminating = -1;
  }
  // The library stays loaded, so its counters can still be read.
  EXPECT_EQ(*cleanups, before + 1);
  EXPECT_EQ(*terminating, 1);
}

TEST(ProviderCleanup, ObjectManagerThatMadeNoMICallsNoCleanup) {
  int* cleanups = nullptr;
  int before = 0;
  {
    ObjectManager om(testProviderOptions());
    cleanups = static_cast<int*>(om.providerSymbol("TestInstanceProvider", "tvrTestInstanceCleanups"));
    ASSERT_NE(cleanups, nullptr);
    before = *cleanups;
  }
  EXPECT_EQ(*cleanups, before);
}

TEST_F(RoutingTest, RegistrationIsTheTableGiven) {
  EXPECT_NE(om.registration().find("TVR_AllTypes"), nullptr);
  EXPECT_EQ(om.registration().associationClasses().size(), 3u);
}

} // namespace
} // namespace tvr::broker::test
