#include "ConsoleDialogHost.h"

#include <iostream>

#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "reduction/UBKBCoordDlg.h"
#include "reduction/UCoordEntryDlg.h"
#include "transfer/DuplicatePtsDlg.h"
#include "transfer/LockedLayersQuestion.h"
#include "transfer/UOverridePolyDlg.h"

namespace {

struct Button {
    const char* key;
    const char* label;
    int answer;
};

// The buttons of a message box, in their order.
std::vector<Button> ButtonsOf(unsigned flags) {
    using namespace nedit::mb;
    switch (flags & ButtonsMask) {
        case OkCancel:
            return {{"o", "OK", IdOk}, {"c", "Cancel", IdCancel}};
        case AbortRetryIgnore:
            return {{"a", "Abort", IdAbort}, {"r", "Retry", IdRetry}, {"i", "Ignore", IdIgnore}};
        case YesNoCancel:
            return {{"y", "Yes", IdYes}, {"n", "No", IdNo}, {"c", "Cancel", IdCancel}};
        case YesNo:
            return {{"y", "Yes", IdYes}, {"n", "No", IdNo}};
        case RetryCancel:
            return {{"r", "Retry", IdRetry}, {"c", "Cancel", IdCancel}};
        default:
            return {{"o", "OK", IdOk}};
    }
}

double AskNumber(const std::string& answer, double fallback) {
    return answer.empty() ? fallback : nedit::TextToDouble(nedit::FromUtf8(answer));
}

}  // namespace

ConsoleDialogHost::ConsoleDialogHost(bool interactive, bool echo)
    : Interactive(interactive), Echo(echo) {
    SetFace<UCoordEntryDlg>([this](UCoordEntryDlg& dialog) {
        if (Interactive) return AskCoordinates(dialog);
        dialog.SetApplyToAll(true);
        return Accept(dialog);
    });
    SetFace<UBKBCoordDlg>([this](UBKBCoordDlg& dialog) {
        return Interactive ? AskBackStation(dialog) : Accept(dialog);
    });
    SetFace<DuplicatePtsDlg>([this](DuplicatePtsDlg& dialog) {
        return Interactive ? AskDuplicatePoint(dialog) : Accept(dialog);
    });
    SetFace<UOverridePolyDlg>([this](UOverridePolyDlg& dialog) {
        return Interactive ? AskOverrideString(dialog) : Accept(dialog);
    });
    SetFace<nedit::LockedLayersQuestion>([this](nedit::LockedLayersQuestion& question) {
        return Interactive ? AskLockedLayers(question) : Accept(question);
    });
}

int ConsoleDialogHost::ShowMessage(const std::wstring& text, unsigned flags, unsigned /*help*/) {
    MessagesShown.push_back(text);
    if (Interactive) return AskMessage(text, flags);
    if (Echo) std::fprintf(stderr, "sxnedit: %s\n", nedit::ToUtf8(text).c_str());
    return nedit::mb::DefaultAnswer(flags);
}

int ConsoleDialogHost::Show(nedit::UDialogLogic& dialog, const Face* face) {
    dialog.OnInitDialog();
    return face != nullptr ? (*face)(dialog) : Accept(dialog);
}

std::string ConsoleDialogHost::ReadAnswer(const std::string& prompt) {
    std::fprintf(stderr, "%s", prompt.c_str());
    std::fflush(stderr);
    std::string line;
    if (!std::getline(std::cin, line)) return {};
    return nedit::ToUtf8(nedit::Trim(nedit::FromUtf8(line)));
}

bool ConsoleDialogHost::InputEnded() const {
    return !std::cin.good();
}

int ConsoleDialogHost::AskDuplicatePoint(DuplicatePtsDlg& dialog) {
    std::fprintf(stderr, "%s\n%s\n", nedit::ToUtf8(dialog.DialogName()).c_str(),
                 nedit::ToUtf8(dialog.Message).c_str());
    do {
        if (InputEnded()) return nedit::mb::IdCancel;
        std::fprintf(stderr,
                     "  o  Overwrite\n  n  Create with a new number: %s\n  p  Create new with a "
                     "prefix: %s\n  a  Abort\n",
                     nedit::ToUtf8(dialog.NewNumber).c_str(), nedit::ToUtf8(dialog.Prefix).c_str());
        const char* const keys = " opn";
        const std::string choice =
            ReadAnswer(std::string("Choice [") +
                       keys[dialog.Mode < 1 || dialog.Mode > 3 ? 1 : dialog.Mode] + "]: ");
        if (choice == "a") return nedit::mb::IdCancel;
        if (choice == "o") dialog.Choose(DuplicatePtsDlg::kOverwrite);
        if (choice == "p") dialog.Choose(DuplicatePtsDlg::kPrefix);
        if (choice == "n") dialog.Choose(DuplicatePtsDlg::kNewNumber);
        if (dialog.IsPrefixEditEnabled()) {
            const std::string prefix =
                ReadAnswer("Prefix [" + nedit::ToUtf8(dialog.Prefix) + "]: ");
            if (!prefix.empty()) dialog.Prefix = nedit::FromUtf8(prefix);
        }
        if (dialog.IsNumberEditEnabled()) {
            const std::string number =
                ReadAnswer("New number [" + nedit::ToUtf8(dialog.NewNumber) + "]: ");
            if (!number.empty()) dialog.NewNumber = nedit::FromUtf8(number);
        }
        dialog.ApplyAll = ReadAnswer("Apply this method to the rest of the process? [y/N] ") == "y";
    } while (!dialog.OnOK());
    return dialog.EndCode();
}

int ConsoleDialogHost::AskOverrideString(UOverridePolyDlg& dialog) {
    std::fprintf(stderr, "%s\n", nedit::ToUtf8(dialog.GetMessage()).c_str());
    const std::string answer = ReadAnswer("[y Yes/n No] (default No) ");
    dialog.ApplyAll = ReadAnswer("Apply to All? [y/N] ") == "y";
    return answer == "y" ? dialog.OnYes() : dialog.OnNo();
}

int ConsoleDialogHost::AskLockedLayers(nedit::LockedLayersQuestion& question) {
    return AskMessage(question.GetMessage(), nedit::mb::OkCancel | nedit::mb::IconQuestion) ==
                   nedit::mb::IdOk
               ? nedit::mb::IdOk
               : nedit::mb::IdCancel;
}

int ConsoleDialogHost::AskMessage(const std::wstring& text, unsigned flags) {
    const std::vector<Button> buttons = ButtonsOf(flags);
    std::fprintf(stderr, "%s\n", nedit::ToUtf8(text).c_str());
    if (buttons.size() == 1) return buttons[0].answer;
    std::string prompt = "[";
    for (const Button& button : buttons)
        prompt += std::string(prompt.size() > 1 ? "/" : "") + button.key + " " + button.label;
    prompt += "] ";
    const std::string answer = ReadAnswer(prompt);
    for (const Button& button : buttons) {
        if (!answer.empty() && answer[0] == button.key[0]) return button.answer;
    }
    return nedit::mb::DefaultAnswer(flags);
}

int ConsoleDialogHost::AskCoordinates(UCoordEntryDlg& dialog) {
    using Source = UCoordEntryDlg::Source;
    std::fprintf(
        stderr,
        "Control Point Coordinate: %s\nSelect the desired source or enter the point coordinates.\n",
        nedit::ToUtf8(dialog.GetName()).c_str());
    const std::pair<Source, const char*> sources[] = {{Source::Database, "d  Database Coordinate"},
                                                      {Source::Field, "f  Field Coordinate"}};
    for (const auto& [source, label] : sources) {
        if (!dialog.IsOffered(source)) continue;
        const UCoordEntryDlg::Row& row = dialog.RowOf(source);
        std::fprintf(stderr, "  %s  E %.3f  N %.3f  H %.3f\n", label, row.East, row.North,
                     row.Height);
    }
    std::fprintf(stderr, "  e  Enter Coordinate\n  c  Cancel\n");
    const std::string choice =
        ReadAnswer("Source [" +
                   std::string(dialog.GetSelectedSource() == Source::Database ? "d"
                               : dialog.GetSelectedSource() == Source::Field  ? "f"
                                                                              : "e") +
                   "]: ");
    if (choice == "c") return nedit::mb::IdCancel;
    if (choice == "d") dialog.SelectSource(Source::Database);
    if (choice == "f") dialog.SelectSource(Source::Field);
    if (choice == "e") dialog.SelectSource(Source::Enter);
    if (dialog.IsEntryEditable()) {
        const UCoordEntryDlg::Row& entered = dialog.RowOf(Source::Enter);
        const double e = AskNumber(ReadAnswer("Easting: "), entered.East);
        const double n = AskNumber(ReadAnswer("Northing: "), entered.North);
        const double h = AskNumber(ReadAnswer("Height (blank for none): "), entered.Height);
        dialog.InitXYZ(e, n, h, entered.Code);
    }
    dialog.SetApplyToAll(ReadAnswer("Apply to All? [y/N] ") == "y");
    return dialog.OnOK() ? nedit::mb::IdOk : nedit::mb::IdCancel;
}

int ConsoleDialogHost::AskBackStation(UBKBCoordDlg& dialog) {
    std::fprintf(stderr, "Back Bearing: %s\n", nedit::ToUtf8(dialog.GetPointName()).c_str());
    const std::string bearing = ReadAnswer("Bearing in degrees (blank to give coordinates): ");
    if (!bearing.empty()) {
        dialog.ApplyBearing = true;
        dialog.Bearing = AskNumber(bearing, 0.0);
        return nedit::mb::IdOk;
    }
    dialog.East = AskNumber(ReadAnswer("Easting: "), 0.0);
    dialog.North = AskNumber(ReadAnswer("Northing: "), 0.0);
    dialog.Height = AskNumber(ReadAnswer("Height: "), 0.0);
    return nedit::mb::IdOk;
}
