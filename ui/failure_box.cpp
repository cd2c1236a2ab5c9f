#include "ui/failure_box.h"

#include "platform/qt_paths.h"
#include "ui/window_layout.h"

#include <QMessageBox>
#include <utility>

namespace {

// A long list shows its first lines, each cut to a screen's width; the whole list is under
// "Show Details", up to a length a text box still handles at once.
constexpr size_t kShownLines = 12;
constexpr qsizetype kShownWidth = 160;
constexpr size_t kDetailLines = 5000;

QString Shown(const std::string &line) {
  const QString text = FromName(line);
  return text.size() > kShownWidth ? text.left(kShownWidth) + "..." : text;
}

// A box with `heading`, the first of `lines`, and all of them under "Show Details".
QMessageBox *ListBox(QWidget *parent, QMessageBox::Icon icon, const std::string &heading,
                     const std::vector<std::string> &lines, QMessageBox::StandardButtons buttons) {
  QString text = FromName(heading);
  for (size_t i = 0; i < lines.size() && i < kShownLines; ++i)
    text += "\n" + Shown(lines[i]);
  if (lines.size() > kShownLines) {
    text += QString("\n... and %1 more.").arg(lines.size() - kShownLines);
    QString details = FromName(heading);
    for (size_t i = 0; i < lines.size() && i < kDetailLines; ++i)
      details += "\n" + FromName(lines[i]);
    if (lines.size() > kDetailLines)
      details += QString("\n... and %1 more.").arg(lines.size() - kDetailLines);
    auto *box = new QMessageBox(icon, WindowCaptionText().simplified(), text, buttons, parent);
    box->setDetailedText(details);
    return box;
  }
  return new QMessageBox(icon, WindowCaptionText().simplified(), text, buttons, parent);
}

std::function<QMessageBox::StandardButton(const QMessageBox &)> nextAnswer;

// The button the player chose in the question `box`, or the one a test set beforehand.
int Answer(QMessageBox &box) {
  if (!nextAnswer)
    return box.exec();
  return std::exchange(nextAnswer, nullptr)(box);
}

} // namespace

void SetNextAnswer(std::function<QMessageBox::StandardButton(const QMessageBox &)> answer) {
  nextAnswer = std::move(answer);
}

void ShowFailures(QWidget *parent, const Failures &failures, const QString &heading) {
  if (failures.Empty())
    return;
  QMessageBox *box =
      ListBox(parent, QMessageBox::Warning, failures.HeadingOr(heading.toStdString()),
              failures.Lines(), QMessageBox::Ok);
  box->setAttribute(Qt::WA_DeleteOnClose);
  box->open();
}

void ShowNotice(QWidget *parent, const std::string &notice) {
  if (notice.empty())
    return;
  const size_t end = notice.find('\n');
  std::vector<std::string> lines;
  for (size_t start = end; start != std::string::npos;) {
    const size_t next = notice.find('\n', start + 1);
    lines.push_back(notice.substr(start + 1, next - start - 1));
    start = next;
  }
  QMessageBox *box =
      ListBox(parent, QMessageBox::Information, notice.substr(0, end), lines, QMessageBox::Ok);
  box->setAttribute(Qt::WA_DeleteOnClose);
  box->open();
}

// "3 files", "1 file".
static std::string Files(size_t count) {
  return std::to_string(count) + (count == 1 ? " file" : " files");
}

bool ConfirmDeletion(QWidget *parent, int loadedFiles, const std::vector<std::string> &names) {
  std::string heading =
      loadedFiles > 0
          ? "Reset All will unload every loaded folder: it takes out the " +
                Files(static_cast<size_t>(loadedFiles)) +
                " they put into the game and puts back the game's own files they replaced."
          : "Reset All will put back the game's own files that add-ons replaced.";
  heading += " The loaded folders are saved first as the setup \"Before Reset All\": switching "
             "to it (right-click the folder grid) loads them again.";
  if (!names.empty())
    heading += " It also deletes these " + Files(names.size()) + " from the game folder:";
  QMessageBox *box =
      ListBox(parent, QMessageBox::Question, heading, names, QMessageBox::Ok | QMessageBox::Cancel);
  box->setObjectName("ConfirmResetAll");
  box->setDefaultButton(QMessageBox::Cancel);
  const bool agreed = Answer(*box) == QMessageBox::Ok;
  delete box;
  return agreed;
}

bool Confirm(QWidget *parent, const QString &question) {
  QMessageBox box(QMessageBox::Question, WindowCaptionText().simplified(), question,
                  QMessageBox::Ok | QMessageBox::Cancel, parent);
  box.setDefaultButton(QMessageBox::Cancel);
  return Answer(box) == QMessageBox::Ok;
}
