#include "ui/forms/UDlgMaker.h"

#include <QButtonGroup>
#include <QCheckBox>
#include <QComboBox>
#include <QGroupBox>
#include <QRadioButton>
#include <QVBoxLayout>
#include <memory>
#include <stdexcept>

#include "platform/text/WideText.h"

namespace nedit {

namespace {

std::string_view TypeWord(std::string_view definition) {
    return definition.substr(0, definition.find(','));
}

}  // namespace

UDlgMaker::UDlgMaker(const UJobSettings* job, QWidget* form)
    : QObject(form), job_(job), form_(form) {}

UEdit::Kind UDlgMaker::KindOf(std::string_view definition) {
    static const std::vector<std::pair<std::string_view, UEdit::Kind>> kinds = {
        {"TEXT", UEdit::Kind::Text},
        {"POINTNAME", UEdit::Kind::PointName},
        {"POINTCODE", UEdit::Kind::PointCode},
        {"LONG", UEdit::Kind::Long},
        {"DOUBLE", UEdit::Kind::Double},
        {"ANGLE", UEdit::Kind::Angle},
        {"VANGLE", UEdit::Kind::VAngle},
        {"BEARING", UEdit::Kind::Bearing},
        {"LENGTH", UEdit::Kind::Length},
        {"DISTANCE", UEdit::Kind::Distance},
        {"COORDINATE", UEdit::Kind::Coordinate},
        {"ELEVATION", UEdit::Kind::Elevation},
    };
    const std::string_view word = TypeWord(definition);
    for (const auto& [name, kind] : kinds) {
        if (name == word) return kind;
    }
    throw std::invalid_argument("no edit for the link text " + std::string(definition));
}

template <class Control, class Signal>
void UDlgMaker::Bind(Control* control, Signal signal, Link link) {
    loading_ = true;
    link.load();
    loading_ = false;
    const std::function<void()> store = link.store;
    connect(control, signal, this, [this, store] {
        if (loading_) return;
        store();
        emit changed();
    });
    links_.push_back(std::move(link));
}

UEdit* UDlgMaker::MakeEdit(std::string_view definition, bool number) {
    auto* edit = new UEdit(KindOf(definition), job_, form_);
    if (edit->IsNumber() != number) {
        delete edit;
        throw std::invalid_argument("the link text " + std::string(definition) +
                                    " does not fit its member");
    }
    return edit;
}

UEdit* UDlgMaker::Edit(std::string_view definition, std::wstring& value) {
    UEdit* edit = MakeEdit(definition, false);
    Bind(edit, &QLineEdit::textChanged,
         {[edit, &value] { edit->setText(QString::fromStdWString(value)); },
          [edit, &value] { value = Trim(edit->text().toStdWString()); }});
    return edit;
}

UEdit* UDlgMaker::Edit(std::string_view definition, double& value) {
    return Edit(
        definition, [&value] { return value; }, [&value](double typed) { value = typed; });
}

UEdit* UDlgMaker::Edit(std::string_view definition, int& value) {
    return Edit(
        definition, [&value] { return static_cast<double>(value); },
        [&value](double typed) { value = static_cast<int>(typed); });
}

UEdit* UDlgMaker::Edit(std::string_view definition, std::function<double()> get,
                       std::function<void(double)> set) {
    UEdit* edit = MakeEdit(definition, true);
    // A value shown and not touched since keeps its places: only a changed field is stored.
    auto edited = std::make_shared<bool>(false);
    connect(edit, &QLineEdit::textChanged, this, [this, edited] {
        if (!loading_) *edited = true;
    });
    Bind(edit, &QLineEdit::textChanged,
         {[edit, get, edited] {
              edit->SetValue(get());
              *edited = false;
          },
          [edit, set, edited] {
              if (*edited) set(edit->Value());
          }});
    return edit;
}

QComboBox* UDlgMaker::List(std::string_view definition, std::wstring& value,
                           const std::vector<std::wstring>& items, bool editable) {
    if (TypeWord(definition) != "TEXT")
        throw std::invalid_argument("a list is linked as TEXT, not " + std::string(definition));
    auto* box = new QComboBox(form_);
    box->setEditable(editable);
    for (const std::wstring& item : items) box->addItem(QString::fromStdWString(item));
    Bind(box, &QComboBox::currentTextChanged,
         {[box, &value] {
              const QString text = QString::fromStdWString(value);
              const int index = box->findText(text, Qt::MatchFixedString);
              box->setCurrentIndex(index);
              if (index < 0 && box->isEditable()) box->setEditText(text);
          },
          [box, &value] { value = Trim(box->currentText().toStdWString()); }});
    return box;
}

QCheckBox* UDlgMaker::Check(std::string_view definition, const QString& text, int& value) {
    return Check(
        definition, text, [&value] { return value != 0; },
        [&value](bool on) { value = on ? 1 : 0; });
}

QCheckBox* UDlgMaker::Check(std::string_view definition, const QString& text, bool& value) {
    return Check(
        definition, text, [&value] { return value; }, [&value](bool on) { value = on; });
}

QCheckBox* UDlgMaker::Check(std::string_view definition, const QString& text,
                            std::function<bool()> get, std::function<void(bool)> set) {
    if (TypeWord(definition) != "CHECK")
        throw std::invalid_argument("a check box is linked as CHECK, not " +
                                    std::string(definition));
    auto* box = new QCheckBox(text, form_);
    Bind(box, &QCheckBox::toggled,
         {[box, get] { box->setChecked(get()); }, [box, set] { set(box->isChecked()); }});
    return box;
}

QButtonGroup* UDlgMaker::Radio(std::string_view definition, int& value,
                               const std::vector<std::pair<int, QString>>& choices) {
    return Radio(
        definition, [&value] { return value; }, [&value](int id) { value = id; }, choices);
}

QButtonGroup* UDlgMaker::Radio(std::string_view definition, std::function<int()> get,
                               std::function<void(int)> set,
                               const std::vector<std::pair<int, QString>>& choices) {
    if (TypeWord(definition) != "RADIO")
        throw std::invalid_argument("a radio group is linked as RADIO, not " +
                                    std::string(definition));
    auto* group = new QButtonGroup(form_);
    for (const auto& [id, text] : choices) group->addButton(new QRadioButton(text, form_), id);
    Bind(group, &QButtonGroup::idToggled,
         {[group, get] {
              if (QAbstractButton* button = group->button(get())) button->setChecked(true);
          },
          [group, set] {
              if (group->checkedId() != -1) set(group->checkedId());
          }});
    return group;
}

QGroupBox* UDlgMaker::RadioBox(const QString& title, QButtonGroup* group, QWidget* parent) {
    auto* box = new QGroupBox(title, parent);
    auto* layout = new QVBoxLayout(box);
    for (QAbstractButton* button : group->buttons()) layout->addWidget(button);
    return box;
}

void UDlgMaker::UpdateData(bool save) {
    loading_ = !save;
    for (const Link& link : links_) (save ? link.store : link.load)();
    loading_ = false;
}

}  // namespace nedit
