// SPDX-License-Identifier: MIT
// What Qt says of a key, in the words of the API.
#include "display/qt/KeyTranslation.h"

#include <QGuiApplication>
#include <QKeyEvent>

#include <InterfaceDefs.h>

#include "display/InputHub.h"
#include "display/KeyMap.h"

namespace BPrivate {

namespace {

// X11 and Wayland number keys as Linux does, from 8 on.
const uint32 kFirstScanCode = 8;

struct QtKey {
	int key;
	uint8 rawKey;
};

const QtKey kQtKeys[] = {{Qt::Key_Escape, kRawEscape}, {Qt::Key_Backspace, kRawBackspace},
	{Qt::Key_Tab, kRawTab}, {Qt::Key_Backtab, kRawTab}, {Qt::Key_Return, kRawEnter},
	{Qt::Key_Enter, kRawNumEnter}, {Qt::Key_Insert, kRawInsert}, {Qt::Key_Delete, kRawDelete},
	{Qt::Key_Home, kRawHome}, {Qt::Key_End, kRawEnd}, {Qt::Key_PageUp, kRawPageUp},
	{Qt::Key_PageDown, kRawPageDown}, {Qt::Key_Left, kRawLeft}, {Qt::Key_Right, kRawRight},
	{Qt::Key_Up, kRawUp}, {Qt::Key_Down, kRawDown}, {Qt::Key_Space, kRawSpace},
	{Qt::Key_Shift, kRawLeftShift}, {Qt::Key_Control, kRawLeftCommand},
	{Qt::Key_Alt, kRawLeftControl}, {Qt::Key_Meta, kRawLeftOption},
	{Qt::Key_Super_L, kRawLeftOption}, {Qt::Key_Super_R, kRawRightOption}, {Qt::Key_Menu, kRawMenu},
	{Qt::Key_CapsLock, kRawCapsLock}, {Qt::Key_NumLock, kRawNumLock},
	{Qt::Key_ScrollLock, kRawScroll}, {Qt::Key_Print, kRawPrint}, {Qt::Key_Pause, kRawPause}};


int32
RawKeyFor(int key)
{
	for (const QtKey& known : kQtKeys) {
		if (known.key == key)
			return known.rawKey;
	}
	if (key >= Qt::Key_F1 && key <= Qt::Key_F12)
		return kRawF1 + key - Qt::Key_F1;
	bool needsShift;
	return key > 0x20 && key < 0x7f ? KeyForChar(QChar(key).toLower().toLatin1(), &needsShift) : 0;
}


bool
HasScanCodes()
{
	static const bool hasScanCodes = QGuiApplication::platformName() == QLatin1String("xcb")
		|| QGuiApplication::platformName().startsWith(QLatin1String("wayland"));
	return hasScanCodes;
}


int32
RawKeyOf(const QKeyEvent& event)
{
	int32 rawKey = 0;
	if (HasScanCodes() && event.nativeScanCode() >= kFirstScanCode)
		rawKey = KeyForEventCode(event.nativeScanCode() - kFirstScanCode);
	return rawKey != 0 ? rawKey : RawKeyFor(event.key());
}


/// The modifier that the key itself is, of the side that it is on.
uint32
OwnModifiers(const QKeyEvent& event, int32 rawKey)
{
	switch (event.key()) {
		case Qt::Key_Shift:
		case Qt::Key_Control:
		case Qt::Key_Alt:
		case Qt::Key_Meta:
		case Qt::Key_Super_L:
		case Qt::Key_Super_R:
			return ModifiersForKey(rawKey);
		default:
			return 0;
	}
}


bool
IsControlCharacter(const QString& text)
{
	return text.size() == 1 && (text[0].unicode() < 0x20 || text[0].unicode() == 0x7f);
}


/// The key's character for a shortcut, where Qt gives a control character or nothing.
BString
ShortcutText(const QKeyEvent& event, uint32 modifiers)
{
	int key = event.key();
	if (key < 0x20 || key >= Qt::Key_Escape)
		return "";
	char32_t character = static_cast<char32_t>(key);
	QString text = QString::fromUcs4(&character, 1);
	if ((modifiers & B_SHIFT_KEY) == 0)
		text = text.toLower();
	return BString(text.toUtf8().constData());
}

} // namespace


uint32
ModifiersOf(int qtModifiers, uint32 locks)
{
	uint32 modifiers = locks & (B_CAPS_LOCK | B_NUM_LOCK | B_SCROLL_LOCK);
	if ((qtModifiers & Qt::ShiftModifier) != 0)
		modifiers |= B_SHIFT_KEY | B_LEFT_SHIFT_KEY;
	if ((qtModifiers & Qt::ControlModifier) != 0)
		modifiers |= B_COMMAND_KEY | B_LEFT_COMMAND_KEY;
	if ((qtModifiers & Qt::AltModifier) != 0)
		modifiers |= B_CONTROL_KEY | B_LEFT_CONTROL_KEY;
	if ((qtModifiers & Qt::MetaModifier) != 0)
		modifiers |= B_OPTION_KEY | B_LEFT_OPTION_KEY;
	return modifiers;
}


KeyInput
TranslateKey(const QKeyEvent& event, uint32 held)
{
	KeyInput input;
	bool down = event.type() == QEvent::KeyPress;
	input.rawKey = RawKeyOf(event);
	input.rawChar = RawCharForKey(input.rawKey);

	// Qt's modifiers leave out, or still have, the key of the event itself.
	uint32 own = OwnModifiers(event, input.rawKey);
	uint32 locks = held;
	if (down && !event.isAutoRepeat() && event.key() == Qt::Key_CapsLock)
		locks ^= B_CAPS_LOCK;
	if (down && !event.isAutoRepeat() && event.key() == Qt::Key_NumLock)
		locks ^= B_NUM_LOCK;
	input.modifiers = ModifiersOf(event.modifiers(), locks);
	if (own != 0) {
		input.modifiers = down ? input.modifiers | own : input.modifiers & ~own;
		return input;
	}
	if (event.key() == Qt::Key_CapsLock || event.key() == Qt::Key_NumLock
		|| event.key() == Qt::Key_AltGr)
		return input;

	// Keys that are no text give the API's bytes for them, whatever the host calls text.
	char byte;
	bool isNamed = event.key() >= Qt::Key_Escape || event.key() == Qt::Key_Space;
	bool isPadDigit = (event.modifiers() & Qt::KeypadModifier) != 0 && event.key() < Qt::Key_Escape;
	if (isNamed && !isPadDigit) {
		int32 named = RawKeyFor(event.key());
		if (named != 0 && BytesForKey(named, 0, &byte) == 1)
			input.bytes.SetTo(&byte, 1);
		return input;
	}

	QString text = event.text();
	bool isShortcut = (input.modifiers & B_COMMAND_KEY) != 0;
	bool isControl = (input.modifiers & B_CONTROL_KEY) != 0;
	if (isShortcut && (text.isEmpty() || IsControlCharacter(text)))
		input.bytes = ShortcutText(event, input.modifiers);
	else
		input.bytes = text.toUtf8().constData();
	if (isControl && !isShortcut && input.bytes.Length() == 1 && input.bytes[0] >= '@')
		input.bytes.SetByteAt(0, input.bytes[0] & 0x1f);
	return input;
}

} // namespace BPrivate
