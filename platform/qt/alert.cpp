#include "platform/alert.h"

#include <QMessageBox>
#include <QPushButton>
#include <memory>
#include <utility>

#include "platform/qt/native.h"

namespace onramp {

void runCriticalAlert(const std::string& messageText, const std::string& informativeText,
                      const std::string& buttonTitle) {
  QMessageBox alert;
  alert.setIcon(QMessageBox::Critical);
  alert.setTextFormat(Qt::PlainText);
  alert.setText(QString::fromStdString(messageText));
  alert.setInformativeText(QString::fromStdString(informativeText));
  alert.setEscapeButton(alert.addButton(qt::titleText(buttonTitle), QMessageBox::AcceptRole));
  alert.exec();
}

void beginAlertSheet(const AlertSheet& sheet, const Window& window,
                     std::function<void(int returnCode)> didEnd) {
  auto* const box = qt::makeChild<QMessageBox>(qt::nativeOf<QWidget>(window));
  box->setAttribute(Qt::WA_DeleteOnClose);
  box->setWindowModality(Qt::WindowModal);
  box->setWindowTitle(box->parentWidget()->windowTitle());
  box->setIcon(QMessageBox::Warning);
  box->setTextFormat(Qt::PlainText);
  box->setText(QString::fromStdString(sheet.title));
  box->setInformativeText(QString::fromStdString(sheet.message));
  const QPushButton* const other =
      box->addButton(qt::titleText(sheet.otherButton), QMessageBox::ActionRole);
  QPushButton* const standard =
      box->addButton(qt::titleText(sheet.defaultButton), QMessageBox::AcceptRole);
  box->setDefaultButton(standard);
  box->setEscapeButton(standard);
  QObject::connect(box, &QMessageBox::finished, box, [box, other, didEnd = std::move(didEnd)] {
    didEnd(box->clickedButton() == other ? kAlertOtherReturn : kAlertDefaultReturn);
  });
  box->open();
}

}  // namespace onramp
