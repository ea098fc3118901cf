// SPDX-License-Identifier: MIT
// MIME types: their texts, the user's database, and guesses by content and name.

#include <MimeType.h>

#include <gtest/gtest.h>

#include <Entry.h>
#include <Errors.h>
#include <File.h>
#include <Message.h>
#include <Node.h>
#include <NodeInfo.h>

#include "support/TemporaryFolder.h"

namespace {

/// A database of its own, empty at first.
class MimeDatabaseTest : public testing::Test {
protected:
	MimeDatabaseTest()
		: fDataHome("XDG_DATA_HOME", fFolder.Path()),
		  fDataDirectories("XDG_DATA_DIRS", fFolder / "system")
	{
	}

	void WriteSystemPackage(const std::string& types) const
	{
		fFolder.Make("system/mime/packages");
		fFolder.Write("system/mime/packages/test.xml",
			"<?xml version=\"1.0\"?>\n<!DOCTYPE mime-info [ <!ELEMENT x (y)> ]>\n<mime-info "
			"xmlns='http://www.freedesktop.org/standards/shared-mime-info'>"
				+ types + "</mime-info>");
	}

	std::string PackageText() const
	{
		for (const auto& file : std::filesystem::directory_iterator(fFolder / "mime/packages"))
			return fFolder.Read("mime/packages/" + file.path().filename().string());
		return "";
	}

	TemporaryFolder fFolder;
	ScopedVariable fDataHome;
	ScopedVariable fDataDirectories;
};


std::string
GuessName(const char* name)
{
	BMimeType type;
	return BMimeType::GuessMimeType(name, &type) == B_OK ? type.Type() : "";
}


std::string
GuessContent(const std::string& content)
{
	BMimeType type;
	return BMimeType::GuessMimeType(content.data(), content.size(), &type) == B_OK ? type.Type()
																				   : "";
}


std::string
TypeOf(const std::string& path)
{
	BNode node(path.c_str());
	char type[B_MIME_TYPE_LENGTH];
	return BNodeInfo(&node).GetType(type) == B_OK ? type : "";
}

// A type for messages with one code, in all the forms that a flattened message has.
const char* const kMessageType =
	"<mime-type type='application/x-test-document'><comment>Document</comment>"
	"<comment xml:lang='de'>Dokument</comment>"
	"<magic priority='80'>"
	"<match type='string' value='HMF1' offset='0'>"
	"<match type='little32' value='0x54657374' offset='4'/></match>"
	"<match type='string' value='1BOF' offset='0'>"
	"<match type='little32' value='0x54657374' offset='12'/></match>"
	"<match type='string' value='FOB1' offset='0'>"
	"<match type='big32' value='0x54657374' offset='12'/></match>"
	"</magic><glob pattern='*.tdoc'/></mime-type>";

} // namespace


TEST(MimeTypeTest, ValidTextsAreToldFromOthers)
{
	for (const char* text : {"text", "text/plain", "application/x-vnd.Be-directory", "a/b+c.d-e_f"})
		EXPECT_TRUE(BMimeType::IsValid(text)) << text;
	for (const char* text : {"", "/", "text/", "/plain", "a/b/c", "a b/c", "a/b\t", "a/b\n",
			 "a/<b>", "a/b;c", "a/b=c", "a/\xc3\xa9"})
		EXPECT_FALSE(BMimeType::IsValid(text)) << text;
	EXPECT_FALSE(BMimeType::IsValid(nullptr));
	EXPECT_TRUE(BMimeType::IsValid(std::string(B_MIME_TYPE_LENGTH - 1, 'x').c_str()));
	EXPECT_FALSE(BMimeType::IsValid(std::string(B_MIME_TYPE_LENGTH, 'x').c_str()));
}


TEST(MimeTypeTest, SettingAnInvalidTextUnsets)
{
	BMimeType type("text/plain");
	EXPECT_EQ(type.InitCheck(), B_OK);
	EXPECT_EQ(type.SetTo("a b"), B_BAD_VALUE);
	EXPECT_EQ(type.InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(type.Type(), nullptr);
	EXPECT_FALSE(type.IsValid());
	EXPECT_FALSE(type.IsInstalled());
	EXPECT_EQ(type.Install(), B_BAD_VALUE);
	EXPECT_EQ(BMimeType().Install(), B_NO_INIT);
	type.Unset();
	EXPECT_EQ(type.InitCheck(), B_NO_INIT);
}


TEST(MimeTypeTest, ComparesWithoutRegardToCase)
{
	const BMimeType type("Text/Plain");
	EXPECT_TRUE(type == "text/PLAIN");
	EXPECT_TRUE(type == BMimeType("text/plain"));
	EXPECT_FALSE(type == "text/html");
	EXPECT_STREQ(type.Type(), "Text/Plain");
}


TEST(MimeTypeTest, SupertypeContainsItsSubtypes)
{
	const BMimeType text("text");
	const BMimeType plain("text/plain");
	const BMimeType textual("textual/plain");
	EXPECT_TRUE(text.IsSupertypeOnly());
	EXPECT_FALSE(plain.IsSupertypeOnly());
	EXPECT_TRUE(text.Contains(&plain));
	EXPECT_FALSE(plain.Contains(&text));
	EXPECT_TRUE(plain.Contains(&plain));
	EXPECT_FALSE(text.Contains(&textual));
	BMimeType supertype;
	EXPECT_EQ(plain.GetSupertype(&supertype), B_OK);
	EXPECT_STREQ(supertype.Type(), "text");
	EXPECT_EQ(text.GetSupertype(&supertype), B_BAD_VALUE);
}


TEST_F(MimeDatabaseTest, InstallingMakesTheTypeKnown)
{
	BMimeType type("application/x-Test");
	EXPECT_FALSE(type.IsInstalled());
	EXPECT_EQ(type.Install(), B_OK);
	EXPECT_TRUE(type.IsInstalled());
	EXPECT_TRUE(BMimeType("APPLICATION/x-test").IsInstalled());
	EXPECT_EQ(type.Install(), B_FILE_EXISTS);
	EXPECT_TRUE(BMimeType("application").IsInstalled());
	EXPECT_EQ(type.Delete(), B_OK);
	EXPECT_FALSE(type.IsInstalled());
	EXPECT_EQ(type.Delete(), B_ENTRY_NOT_FOUND);
}


TEST_F(MimeDatabaseTest, ATypeIsInstalledHoweverItsPackageSpellsIt)
{
	WriteSystemPackage("<mime-type type='application/X-One'><comment>application/x-named</comment>"
					   "</mime-type><mime-type type='application&#x2F;x-two'/>"
					   "<mime-type type='application/x-three-and-more'/>");
	const auto check = [] {
		EXPECT_TRUE(BMimeType("application/x-one").IsInstalled());
		EXPECT_TRUE(BMimeType("application/X-Two").IsInstalled());
		EXPECT_FALSE(BMimeType("application/x-three").IsInstalled());
		EXPECT_FALSE(BMimeType("application/x-named").IsInstalled());
	};
	check();
	// From here on all packages are known.
	BMessage types;
	BMimeType::GetInstalledTypes(&types);
	check();
}


TEST_F(MimeDatabaseTest, SettersInstallAndKeepWhatWasSetBefore)
{
	BMimeType type("application/x-test");
	char text[256];
	EXPECT_EQ(type.GetShortDescription(text), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(type.SetShortDescription("<Short> & \"sweet\""), B_OK);
	EXPECT_TRUE(type.IsInstalled());
	EXPECT_EQ(type.SetLongDescription("Long"), B_OK);
	EXPECT_EQ(type.SetPreferredApp("application/x-vnd.Test-App"), B_OK);
	BMessage extensions;
	extensions.AddString("extensions", "one");
	extensions.AddString("extensions", "two");
	EXPECT_EQ(type.SetFileExtensions(&extensions), B_OK);

	EXPECT_EQ(type.GetShortDescription(text), B_OK);
	EXPECT_STREQ(text, "<Short> & \"sweet\"");
	EXPECT_EQ(type.GetLongDescription(text), B_OK);
	EXPECT_STREQ(text, "Long");
	EXPECT_EQ(type.GetPreferredApp(text), B_OK);
	EXPECT_STREQ(text, "application/x-vnd.Test-App");
	BMessage read;
	EXPECT_EQ(type.GetFileExtensions(&read), B_OK);
	EXPECT_STREQ(read.FindString("extensions", 0), "one");
	EXPECT_STREQ(read.FindString("extensions", 1), "two");
	EXPECT_EQ(GuessName("a.two"), "application/x-test");

	EXPECT_EQ(type.SetShortDescription(nullptr), B_OK);
	EXPECT_EQ(type.GetShortDescription(text), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(type.SetFileExtensions(nullptr), B_OK);
	EXPECT_EQ(type.GetFileExtensions(&read), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(type.GetLongDescription(text), B_OK);
}


TEST_F(MimeDatabaseTest, PackageIsWhatTheDesktopReads)
{
	BMimeType type("application/x-test");
	ASSERT_EQ(type.SetShortDescription("A test"), B_OK);
	BMessage extensions;
	extensions.AddString("extensions", "tst");
	ASSERT_EQ(type.SetFileExtensions(&extensions), B_OK);
	const std::string package = PackageText();
	EXPECT_NE(package.find("<mime-type type=\"application/x-test\">"), std::string::npos);
	EXPECT_NE(package.find("<comment>A test</comment>"), std::string::npos);
	EXPECT_NE(package.find("<glob pattern=\"*.tst\"/>"), std::string::npos);

	if (system("command -v update-mime-database >/dev/null") == 0) {
		const std::string described = fFolder.Read("mime/application/x-test.xml");
		EXPECT_NE(described.find("A test"), std::string::npos) << described;
		EXPECT_NE(fFolder.Read("mime/globs2").find("application/x-test:*.tst"), std::string::npos);
	}
}


TEST_F(MimeDatabaseTest, WorksWithoutTheDesktopsTool)
{
	const ScopedVariable path("PATH", fFolder / "nothing-here");
	BMimeType type("application/x-test");
	EXPECT_EQ(type.SetShortDescription("A test"), B_OK);
	EXPECT_TRUE(type.IsInstalled());
	EXPECT_FALSE(std::filesystem::exists(fFolder / "mime/globs2"));
}


TEST_F(MimeDatabaseTest, BadTextsAreRefusedAndChangeNothing)
{
	BMimeType type("application/x-test");
	BMessage extensions;
	extensions.AddString("extensions", "a/b");
	EXPECT_EQ(type.SetFileExtensions(&extensions), B_BAD_VALUE);
	EXPECT_EQ(type.SetShortDescription("\1"), B_BAD_VALUE);
	EXPECT_EQ(type.SetShortDescription("\xff"), B_BAD_VALUE);
	EXPECT_EQ(type.SetLongDescription(std::string(256, 'x').c_str()), B_BAD_VALUE);
	EXPECT_EQ(type.SetPreferredApp("no signature"), B_BAD_VALUE);
	EXPECT_FALSE(type.IsInstalled());
}


TEST_F(MimeDatabaseTest, DatabaseThatCannotBeWrittenIsReported)
{
	fFolder.Write("mime", "in the way");
	BMimeType type("application/x-test");
	EXPECT_EQ(type.Install(), B_NOT_A_DIRECTORY);
	EXPECT_FALSE(type.IsInstalled());
}


TEST_F(MimeDatabaseTest, SystemsTypesAreKnownAndCanBeRefined)
{
	WriteSystemPackage(kMessageType);
	BMimeType type("application/x-test-document");
	char text[256];
	EXPECT_TRUE(type.IsInstalled());
	EXPECT_EQ(type.Install(), B_FILE_EXISTS);
	EXPECT_EQ(type.GetShortDescription(text), B_OK);
	EXPECT_STREQ(text, "Document");
	EXPECT_EQ(type.Delete(), B_NOT_ALLOWED);

	EXPECT_EQ(type.SetShortDescription("Mine"), B_OK);
	EXPECT_EQ(type.GetShortDescription(text), B_OK);
	EXPECT_STREQ(text, "Mine");
	EXPECT_EQ(GuessName("x.tdoc"), "application/x-test-document");
	BMessage extensions;
	extensions.AddString("extensions", "mine");
	EXPECT_EQ(type.SetFileExtensions(&extensions), B_OK);
	EXPECT_EQ(GuessName("x.tdoc"), B_FILE_MIME_TYPE);
	EXPECT_EQ(GuessName("x.mine"), "application/x-test-document");
	EXPECT_EQ(type.Delete(), B_OK);
	EXPECT_EQ(GuessName("x.tdoc"), "application/x-test-document");
}


TEST_F(MimeDatabaseTest, InstalledTypesAreListed)
{
	WriteSystemPackage(kMessageType);
	BMimeType("text/x-one").Install();
	BMimeType("single").Install();
	BMessage types;
	ASSERT_EQ(BMimeType::GetInstalledTypes(&types), B_OK);
	EXPECT_STREQ(types.FindString("types", 0), "application/x-test-document");
	EXPECT_STREQ(types.FindString("types", 1), "single");
	EXPECT_STREQ(types.FindString("types", 2), "text/x-one");
	EXPECT_FALSE(types.HasString("types", 3));
	ASSERT_EQ(BMimeType::GetInstalledTypes("text", &types), B_OK);
	EXPECT_STREQ(types.FindString("types", 0), "text/x-one");
	EXPECT_FALSE(types.HasString("types", 1));
	ASSERT_EQ(BMimeType::GetInstalledSupertypes(&types), B_OK);
	EXPECT_STREQ(types.FindString("super_types", 2), "text");
	EXPECT_EQ(BMimeType::GetInstalledTypes("a/b", &types), B_BAD_VALUE);
}


TEST_F(MimeDatabaseTest, MessageCodeTellsTheTypeInEveryForm)
{
	WriteSystemPackage(kMessageType);
	const std::string size(4, '\0');
	EXPECT_EQ(GuessContent("HMF1tseT" + size), "application/x-test-document");
	EXPECT_EQ(GuessContent("1BOF" + size + size + "tseT"), "application/x-test-document");
	EXPECT_EQ(GuessContent("FOB1" + size + size + "Test"), "application/x-test-document");
	EXPECT_EQ(GuessContent("HMF1Test" + size), B_FILE_MIME_TYPE);
	EXPECT_EQ(GuessContent("HMF1tse"), "text/plain");
}


TEST_F(MimeDatabaseTest, SureContentBeatsTheNameAndTheNameOtherContent)
{
	WriteSystemPackage("<mime-type type='x/sure'><magic priority='80'><match type='string' "
					   "value='SURE' offset='0'/></magic></mime-type>"
					   "<mime-type type='x/vague'><magic priority='40'><match type='string' "
					   "value='VAGUE' offset='0'/></magic></mime-type>"
					   "<mime-type type='x/name'><glob pattern='*.nam'/></mime-type>");
	EXPECT_EQ(TypeOf(fFolder.Write("a.nam", "SURE")), "x/sure");
	EXPECT_EQ(TypeOf(fFolder.Write("b.nam", "VAGUE")), "x/name");
	EXPECT_EQ(TypeOf(fFolder.Write("c", "VAGUE")), "x/vague");
}


TEST_F(MimeDatabaseTest, RulesForContentDoWhatTheFormatSays)
{
	const struct {
		const char* rule;
		std::string yes;
		std::string no;
	} cases[] = {
		{"type='string' value='b' offset='1:3'", "..b", "b..."},
		{"type='string' value='\\x41\\102\\n\\\\' offset='0'", "AB\n\\", "ABn\\"},
		{"type='string' value='&lt;&amp;&gt;' offset='0'", "<&>", "&lt;"},
		{"type='string' value='AB' mask='0xdfdf' offset='0'", "ab", "ac"},
		{"type='big16' value='0x4142' offset='0'", "AB", "BA"},
		{"type='little16' value='0x4142' offset='0'", "BA", "AB"},
		{"type='big32' value='0x41424344' offset='0'", "ABCD", "DCBA"},
		{"type='byte' value='65' offset='2'", "..A", "A.."},
		{"type='big16' value='0x4100' mask='0xff00' offset='0'", "Az", "zA"},
		{"type='string' value='A' offset='4294967295'", "", "A"},
		{"type='unknown' value='A' offset='0'", "", "A"},
		{"type='string' value='' offset='0'", "", "A"},
	};
	for (const auto& test : cases) {
		WriteSystemPackage(std::string("<mime-type type='x/rule'><magic><match ") + test.rule
			+ "/></magic></mime-type>");
		if (!test.yes.empty()) {
			EXPECT_EQ(GuessContent(test.yes), "x/rule") << test.rule;
		}
		EXPECT_NE(GuessContent(test.no), "x/rule") << test.rule;
	}
}


TEST_F(MimeDatabaseTest, NamesAreMatchedAsTheFormatSays)
{
	WriteSystemPackage(
		"<mime-type type='x/c'><glob pattern='*.c'/></mime-type>"
		"<mime-type type='x/cpp'><glob pattern='*.C' case-sensitive='true'/></mime-type>"
		"<mime-type type='x/gz'><glob pattern='*.gz'/></mime-type>"
		"<mime-type type='x/tar'><glob pattern='*.tar.gz'/></mime-type>"
		"<mime-type type='x/make'><glob pattern='makefile'/></mime-type>"
		"<mime-type type='x/light'><glob pattern='*.long.tar.gz' weight='10'/></mime-type>"
		"<mime-type type='x/wild'><glob pattern='read[0-9]*'/></mime-type>");
	EXPECT_EQ(GuessName("a.c"), "x/c");
	EXPECT_EQ(GuessName("a.C"), "x/cpp");
	EXPECT_EQ(GuessName("a.GZ"), "x/gz");
	EXPECT_EQ(GuessName("a.long.tar.gz"), "x/tar");
	EXPECT_EQ(GuessName("Makefile"), "x/make");
	EXPECT_EQ(GuessName("xmakefile"), B_FILE_MIME_TYPE);
	EXPECT_EQ(GuessName("read1me"), "x/wild");
	EXPECT_EQ(GuessName("/some/folder/a.c"), "x/c");
	EXPECT_EQ(GuessName("none"), B_FILE_MIME_TYPE);
}


TEST_F(MimeDatabaseTest, DamagedPackagesLoseOnlyThemselves)
{
	const std::string good = "<mime-type type='x/good'><glob pattern='*.good'/></mime-type>";
	for (const char* damage :
		{"<", "<a", "<a b", "<a b=", "<a b='", "<!--", "<![CDATA[", "<!DOCTYPE", "<?",
			"<mime-type type='x/y'>", "<mime-type type='x/y'><magic><a/>", "</", "<a/b>",
			"<mime-type type='x/y'><comment><b/></comment>", "&#xffffffffff;&;&", "<a b='&#0;'"}) {
		fFolder.Make("system/mime/packages");
		fFolder.Write("system/mime/packages/damaged.xml", "<mime-info>" + good + damage);
		EXPECT_EQ(GuessName("a.good"), "x/good") << damage;
		EXPECT_FALSE(BMimeType("x/y").IsInstalled()) << damage;
	}
	std::string deep = "<mime-type type='x/deep'><magic>";
	for (int i = 0; i < 100000; i++)
		deep += "<match type='string' value='a' offset='0'>";
	WriteSystemPackage(deep);
	EXPECT_FALSE(BMimeType("x/deep").IsInstalled());
}


TEST_F(MimeDatabaseTest, NodesOfOtherKindsHaveTypesOfTheirOwn)
{
	BMimeType type;
	const auto guess = [&type](const std::string& path) {
		entry_ref ref;
		get_ref_for_path(path.c_str(), &ref);
		return BMimeType::GuessMimeType(&ref, &type) == B_OK ? type.Type() : "";
	};
	fFolder.Link("nowhere", "link");
	EXPECT_STREQ(guess(fFolder.Make("sub")), "application/x-vnd.Be-directory");
	EXPECT_STREQ(guess(fFolder / "link"), "application/x-vnd.Be-symlink");
	EXPECT_STREQ(guess("/proc/self/exe"), "application/x-vnd.Be-symlink");
	EXPECT_STREQ(guess(fFolder.Write("text", "plain \xc3\xa9\n")), "text/plain");
	EXPECT_STREQ(guess(fFolder.Write("data", std::string("\0\1", 2))), B_FILE_MIME_TYPE);
	EXPECT_STREQ(guess(fFolder.Write("empty")), B_FILE_MIME_TYPE);
	EXPECT_STREQ(guess(fFolder.Write("elf", "\177ELF\2\1\1")), B_APP_MIME_TYPE);
	EXPECT_STREQ(guess(fFolder / "missing"), "");
}


TEST_F(MimeDatabaseTest, NodeInfoGuessesWhatTheFileDoesNotSay)
{
	WriteSystemPackage(kMessageType);
	EXPECT_EQ(TypeOf(fFolder.Write("document", "HMF1tseT....")), "application/x-test-document");
	EXPECT_EQ(TypeOf(fFolder.Write("a.tdoc")), "application/x-test-document");
	EXPECT_EQ(TypeOf(fFolder.Path()), "application/x-vnd.Be-directory");
	char type[B_MIME_TYPE_LENGTH] = "old";
	BNode node(fFolder.Write("nothing").c_str());
	EXPECT_EQ(BNodeInfo(&node).GetType(type), B_ENTRY_NOT_FOUND);
	EXPECT_STREQ(type, "old");

	BFile writeOnly((fFolder / "document").c_str(), B_WRITE_ONLY);
	EXPECT_EQ(BNodeInfo(&writeOnly).GetType(type), B_OK);
	EXPECT_STREQ(type, "application/x-test-document");
}
