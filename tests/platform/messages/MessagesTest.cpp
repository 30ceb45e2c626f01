#include <gtest/gtest.h>

#include "../../support/HeadlessDialogHost.h"
#include "platform/messages/DialogHost.h"
#include "platform/messages/Translate.h"

using namespace nedit;

TEST(Translate, PlaceholdersAreFilledAndCataloguesReplaceEnglish) {
    EXPECT_EQ(Translate(L"Failed to open {1}.", {L"/tmp/a.neu"}), L"Failed to open /tmp/a.neu.");
    EXPECT_EQ(FillPlaceholders(L"{2} before {1}, {1} again", {L"A", L"B"}), L"B before A, A again");
    // Placeholders without an argument, and braces that are no placeholder, stay as written.
    EXPECT_EQ(FillPlaceholders(L"{1} {3} {} {x} {", {L"A"}), L"A {3} {} {x} {");
    TranslationCatalogue::Instance().Set(L"Failed to open {1}.", L"Echec d'ouverture de {1}.");
    EXPECT_EQ(Translate(L"Failed to open {1}.", {L"a.neu"}), L"Echec d'ouverture de a.neu.");
    TranslationCatalogue::Instance().Clear();
    EXPECT_EQ(Translate(L"Neutral file header not found."), L"Neutral file header not found.");
}

TEST(DialogHost, DefaultButtonsFollowTheFlags) {
    EXPECT_EQ(mb::DefaultAnswer(mb::Ok | mb::IconStop), mb::IdOk);
    EXPECT_EQ(mb::DefaultAnswer(36), mb::IdYes);  // Yes and No with a question mark
    EXPECT_EQ(mb::DefaultAnswer(mb::YesNo | mb::DefButton2), mb::IdNo);
    EXPECT_EQ(mb::DefaultAnswer(mb::YesNoCancel | mb::DefButton3), mb::IdCancel);
    EXPECT_EQ(mb::DefaultAnswer(mb::OkCancel), mb::IdOk);
    EXPECT_EQ(AppMessageBox(nullptr, L"nobody sees this", mb::YesNo | mb::DefButton2), mb::IdNo);
}

namespace {
class AskName : public UDialogLogic {
  public:
    std::wstring DialogName() const override { return L"AskName"; }
    bool OnOK() override { return !name.empty(); }
    std::wstring name;
};
}  // namespace

TEST(DialogHost, HeadlessHostRecordsMessagesAndFollowsItsScript) {
    HeadlessDialogHost host;
    host.QueueAnswer(mb::IdNo);
    EXPECT_EQ(AppMessageBox(&host, L"Overwrite Existing Data?", mb::YesNo), mb::IdNo);
    EXPECT_EQ(AppMessageBox(&host, L"Start Downloading", mb::OkCancel), mb::IdOk);
    ASSERT_EQ(host.Messages().size(), 2u);
    EXPECT_EQ(host.Messages()[0].text, L"Overwrite Existing Data?");
    EXPECT_EQ(host.Messages()[1].flags, mb::OkCancel);

    AskName dialog;
    EXPECT_EQ(host.Run(dialog), mb::IdCancel);  // an empty name is refused by OnOK
    host.SetFace<AskName>([](AskName& shown) {
        shown.name = L"P1";
        return shown.OnOK() ? mb::IdOk : mb::IdCancel;
    });
    EXPECT_EQ(host.Run(dialog), mb::IdOk);
    EXPECT_EQ(dialog.name, L"P1");
    EXPECT_EQ(host.DialogsRun().size(), 2u);
}

namespace {
// A dialog of another type under the same name: faces go by type, not by name.
class AskNameAgain : public AskName {};
}  // namespace

TEST(DialogHost, AFaceServesItsOwnTypeAndTheDefaultAllOthers) {
    HeadlessDialogHost host;
    int faced = 0;
    host.SetFace<AskName>([&faced](AskName& shown) {
        ++faced;
        shown.name = L"faced";
        return mb::IdOk;
    });
    AskName first;
    AskNameAgain second;
    second.name = L"given";
    EXPECT_EQ(host.Run(first), mb::IdOk);
    EXPECT_EQ(host.Run(second), mb::IdOk);  // accepted by the default face, as it stands
    EXPECT_EQ(faced, 1);
    EXPECT_EQ(first.name, L"faced");
    EXPECT_EQ(second.name, L"given");
    EXPECT_EQ(host.DialogsRun(), (std::vector<std::wstring>{L"AskName", L"AskName"}));
}
