#pragma once
// The binding of a form's controls to the members of its dialog logic object, by the link
// texts the system's dialogs have always been described with: a type word and, after
// commas, its parameters ("TEXT", "TEXT,COM2", "CHECK,1", "RADIO,1,", "LONG", "DOUBLE",
// "LENGTH", "DISTANCE", "COORDINATE", "ELEVATION", "ANGLE", "VANGLE", "BEARING",
// "POINTCODE", "POINTNAME,NEDT,,4"). The type word picks the control and how its value is
// read and shown (UEdit); every form makes its controls here, so they all behave alike.
//
// A control writes its member as soon as it changes, and then says so by changed(), on
// which a form re-applies its logic object's enabling rules. After a handler of the logic
// object has changed members, UpdateData(false) shows them again; UpdateData(true) takes
// every control into its member.
//
// Decisions:
// - A default in a link text ("CHECK,1", "TEXT,COM2") is the member's starting value. The
//   logic object holds it from its construction and may have read a stored value over it
//   since, so the binding does not set it again.
// - A number is written to its member only when its field was changed; showing a value
//   rounds it to the places shown, and a value nobody touched keeps all its places.

#include <QObject>
#include <QString>
#include <functional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "ui/forms/UEdit.h"

class QButtonGroup;
class QCheckBox;
class QComboBox;
class QGroupBox;
class UJobSettings;

namespace nedit {

class UDlgMaker : public QObject {
    Q_OBJECT
  public:
    /// Controls are made as children of `form`; numbers show in the units of `job`.
    UDlgMaker(const UJobSettings* job, QWidget* form);

    /// The edit that a link text's type word names. Throws std::invalid_argument for a word
    /// that names no edit ("CHECK", "RADIO", a misspelling).
    static UEdit::Kind KindOf(std::string_view definition);

    /// An edit of a text kind ("TEXT", "POINTNAME", "POINTCODE") on `value`.
    UEdit* Edit(std::string_view definition, std::wstring& value);
    /// An edit of a number kind on `value`, in degrees or the job's length unit.
    UEdit* Edit(std::string_view definition, double& value);
    /// A whole number ("LONG").
    UEdit* Edit(std::string_view definition, int& value);
    /// An edit of a number kind on a value reached through `get` and `set`.
    UEdit* Edit(std::string_view definition, std::function<double()> get,
                std::function<void(double)> set);
    /// A list of `items` ("TEXT"): a drop list, or with `editable` a combo box that may be
    /// typed in. A value that is not among the items shows as typed, or as no selection.
    QComboBox* List(std::string_view definition, std::wstring& value,
                    const std::vector<std::wstring>& items, bool editable);
    /// A check box ("CHECK,0", "CHECK,1").
    QCheckBox* Check(std::string_view definition, const QString& text, int& value);
    QCheckBox* Check(std::string_view definition, const QString& text, bool& value);
    QCheckBox* Check(std::string_view definition, const QString& text, std::function<bool()> get,
                     std::function<void(bool)> set);
    /// A radio group ("RADIO,1,"): a button per choice, each with the value it gives `value`
    /// (the number of its control, or its index), in the order given.
    QButtonGroup* Radio(std::string_view definition, int& value,
                        const std::vector<std::pair<int, QString>>& choices);
    QButtonGroup* Radio(std::string_view definition, std::function<int()> get,
                        std::function<void(int)> set,
                        const std::vector<std::pair<int, QString>>& choices);

    /// A box titled `title` with the buttons of a radio group one under the other.
    static QGroupBox* RadioBox(const QString& title, QButtonGroup* group, QWidget* parent);

    /// With `save`, every control's value goes to its member; else every member is shown.
    void UpdateData(bool save);

    QWidget* Form() const { return form_; }

  signals:
    /// The user changed a control; its member holds the new value.
    void changed();

  private:
    struct Link {
        std::function<void()> load;
        std::function<void()> store;
    };
    /// Shows the member now, and stores the control whenever `signal` of `control` fires.
    template <class Control, class Signal>
    void Bind(Control* control, Signal signal, Link link);
    UEdit* MakeEdit(std::string_view definition, bool number);

    const UJobSettings* job_;
    QWidget* form_;
    std::vector<Link> links_;
    bool loading_ = false;
};

}  // namespace nedit
