#pragma once
// The modeless find of the record list: find only, downward at first, with an empty text.
// "Find Next" searches the list from its selection with the direction, case and whole word
// as set; the list says "{1} not found." itself.

#include <QDialog>

class QCheckBox;
class QLineEdit;
class QRadioButton;

namespace nedit {

class FindRecordDialog : public QDialog {
    Q_OBJECT
  public:
    explicit FindRecordDialog(QWidget* parent = nullptr);

    QLineEdit* TextField() const { return text_; }
    QCheckBox* MatchCaseBox() const { return match_case_; }
    QCheckBox* WholeWordBox() const { return whole_word_; }
    QRadioButton* UpButton() const { return up_; }

  signals:
    /// The trimmed text is not empty.
    void findNext(const QString& text, bool down, bool matchCase, bool wholeWord);

  private:
    void FindNext();

    QLineEdit* text_;
    QCheckBox* match_case_;
    QCheckBox* whole_word_;
    QRadioButton* up_;
    QRadioButton* down_;
};

}  // namespace nedit
