#include "ui/QtClipboard.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QMimeData>

namespace nedit {

bool QtClipboard::GetText(std::wstring& text) {
    const QMimeData* data = QGuiApplication::clipboard()->mimeData();
    if (data == nullptr || !data->hasText()) return false;
    text = data->text().toStdWString();
    return true;
}

bool QtClipboard::SetText(const std::wstring& text) {
    QGuiApplication::clipboard()->setText(QString::fromStdWString(text));
    return true;
}

}  // namespace nedit
