#include <gtest/gtest.h>

#include "platform/messages/DialogHost.h"
#include "platform/messages/HeadlessDialogHost.h"
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
    EXPECT_EQ(host.RunDialog(dialog), mb::IdCancel);  // an empty name is refused by OnOK
    host.SetDialogScript(L"AskName", [](UDialogLogic& shown) {
        static_cast<AskName&>(shown).name = L"P1";
        return shown.OnOK() ? mb::IdOk : mb::IdCancel;
    });
    EXPECT_EQ(host.RunDialog(dialog), mb::IdOk);
    EXPECT_EQ(dialog.name, L"P1");
    EXPECT_EQ(host.DialogsRun().size(), 2u);
}
