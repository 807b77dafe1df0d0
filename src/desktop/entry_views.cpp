#include "desktop/entry_views.h"

#include <QAbstractItemView>
#include <QApplication>

#include "data/runtime_error.h"
#include "desktop/encoding.h"
#include "desktop/theme.h"

namespace marlowbeck {
namespace {

/// A record may hold a day that no calendar has. The box stands on its first day then, which it
/// shows as no date.
bool CanBeShown(Date date) {
  try {
    static_cast<void>(CivilFromDate(date));
    return true;
  } catch (const RunTimeError&) {
    return false;
  }
}

}  // namespace

TextView::TextView(TextBox& control, QLineEdit* box, Windows& windows)
    : CaptionedView(control, box, windows), model_(control), box_(*box) {
  box_.setAcceptDrops(false);
  connect(box, &QLineEdit::textEdited, this, [this](const QString& text) {
    Do([&](Hand& hand) { return hand.Retype(model_, FromQt(text)); });
  });
}

bool TextView::ClicksAt(const QWidget& /*on*/, QPoint /*at*/) const {
  return static_cast<bool>(model_.Click);
}

void TextView::ShowKind() {
  if (box_.isReadOnly() != model_.Locked()) ShowLocked();
  if (FromQt(box_.text()) == model_.Text()) return;
  box_.setText(ToQt(model_.Text()));
  // What nobody types is read from its beginning.
  if (model_.Locked()) box_.setCursorPosition(0);
}

/// White is for what can be typed into.
void TextView::ShowLocked() {
  box_.setReadOnly(model_.Locked());
  QPalette palette = box_.palette();
  for (const auto group : {QPalette::Active, QPalette::Inactive}) {
    palette.setColor(
        group, QPalette::Base,
        QApplication::palette().color(model_.Locked() ? QPalette::Window : QPalette::Base));
  }
  box_.setPalette(palette);
}

void TextView::ReadKind(ControlState& state) const {
  state.text = FromQt(box_.text());
  state.locked = box_.isReadOnly();
}

ComboView::ComboView(ComboBox& control, QComboBox* box, Windows& windows)
    : CaptionedView(control, box, windows), model_(control), box_(*box) {
  box_.setInsertPolicy(QComboBox::NoInsert);
  box_.setMaxVisibleItems(20);
  connect(box, &QComboBox::activated, this,
          [this](int line) { Do([=, this](Hand& hand) { return hand.Pick(model_, line); }); });
}

void ComboView::FocusCame() {
  if (box_.isEditable()) box_.lineEdit()->selectAll();
}

/// One that is held neither drops down nor goes to another line.
bool ComboView::Pressed(const QWidget& /*on*/, const QMouseEvent& /*event*/) {
  return model_.Held();
}

bool ComboView::Typed(const QKeyEvent& /*event*/) { return model_.Held(); }

void ComboView::ShowEditable() {
  if (box_.isEditable() == !model_.Locked()) return;
  box_.setEditable(!model_.Locked());
  if (!box_.isEditable()) return;
  box_.setCompleter(nullptr);
  box_.lineEdit()->setFocusPolicy(Qt::TabFocus);
  box_.lineEdit()->setAcceptDrops(false);
  connect(box_.lineEdit(), &QLineEdit::textEdited, this, [this](const QString& text) {
    Do([&](Hand& hand) { return hand.Retype(model_, FromQt(text)); });
  });
}

void ComboView::ShowLines() {
  const auto& lines = model_.Lines();
  bool same = box_.count() == model_.Count();
  for (int i = 0; same && i < model_.Count(); ++i) {
    same = FromQt(box_.itemText(i)) == lines[static_cast<std::size_t>(i)];
  }
  if (same) return;
  box_.clear();
  for (const std::string& line : lines) box_.addItem(ToQt(line));
}

/// A locked combo may hold a text that is none of its lines; it stands where nothing is picked.
void ComboView::ShowKind() {
  ShowEditable();
  if (box_.property(kHeld).toBool() != model_.Held()) {
    box_.setProperty(kHeld, model_.Held());
    box_.update();
  }
  // Another current line would take the cursor out of what is being typed.
  const int cursor = box_.isEditable() ? box_.lineEdit()->cursorPosition() : 0;
  ShowLines();
  // Before the line: where none is current the box goes to its first one once this is empty.
  if (!box_.isEditable()) box_.setPlaceholderText(ToQt(model_.Text()));
  if (box_.currentIndex() != model_.Index()) box_.setCurrentIndex(model_.Index());
  if (box_.isEditable() && FromQt(box_.currentText()) != model_.Text()) {
    box_.setEditText(ToQt(model_.Text()));
    box_.lineEdit()->setCursorPosition(cursor);
  }
}

void ComboView::ReadKind(ControlState& state) const {
  auto& lines = state.lines.emplace();
  for (int i = 0; i < box_.count(); ++i) lines.push_back(FromQt(box_.itemText(i)));
  state.index = box_.currentIndex();
  const bool placeholder = !box_.isEditable() && box_.currentIndex() < 0;
  state.text = FromQt(placeholder ? box_.placeholderText() : box_.currentText());
  state.locked = !box_.isEditable();
}

DateView::DateView(DatePicker& control, QDateEdit* box, Windows& windows)
    : CaptionedView(control, box, windows), model_(control), box_(*box) {
  box_.setDisplayFormat("dd/MM/yyyy");
  box_.setCalendarPopup(true);
  box_.setDateRange(QDate(100, 1, 1), QDate(9999, 12, 31));
  box_.setSpecialValueText("no date");
  box_.setKeyboardTracking(false);
  box_.setAcceptDrops(false);
  connect(box, &QDateEdit::userDateChanged, this, [this](QDate date) {
    Do([=, this](Hand& hand) { return hand.PickDate(model_, FromQt(date)); });
  });
}

/// Not where the calendar drops down.
bool DateView::ClicksAt(const QWidget& on, QPoint /*at*/) const {
  return model_.Click && &on != &box_;
}

void DateView::ShowKind() {
  const QDate date = CanBeShown(model_.Value()) ? ToQt(model_.Value()) : box_.minimumDate();
  if (box_.date() != date) box_.setDate(date);
}

void DateView::ReadKind(ControlState& state) const {
  constexpr double kDayOfNoCalendar = 1e300;
  const bool shows_none = box_.text() == box_.specialValueText();
  state.date = shows_none ? Date{kDayOfNoCalendar} : FromQt(box_.date());
}

}  // namespace marlowbeck
