// SPDX-License-Identifier: MIT
// What other programs drop or put on the clipboard, as messages, and back.
#include "display/qt/DropData.h"

#include <chrono>
#include <cstring>
#include <vector>

#include <QByteArray>
#include <QMimeData>
#include <QSysInfo>
#include <QUrl>

#include <DataIO.h>
#include <Entry.h>
#include <Message.h>
#include <Path.h>

#include "display/DragFields.h"

namespace BPrivate {

namespace {

const char* const kTextType = "text/plain";
const char* const kUrlListType = "text/uri-list";
// A flattened message, as the kits write it.
const char* const kMessageType = "application/x-vnd.be-message";

// Qt waits five seconds for each answer of a program that gives none; one that answers gives something.
const std::chrono::milliseconds kNoAnswer(4500);


/// Tells a form that came empty from one that did not come at all.
class AnswerClock {
public:
	bool IsTimeout() const { return std::chrono::steady_clock::now() - fStart >= kNoAnswer; }

private:
	const std::chrono::steady_clock::time_point fStart = std::chrono::steady_clock::now();
};


void
AddText(BMessage* message, const QString& text)
{
	QByteArray utf8 = text.toUtf8();
	message->AddData(kTextType, B_MIME_TYPE, utf8.constData(), utf8.size(), false);
}


bool
FindWholeMessage(const QMimeData& data, BMessage* message)
{
	if (!data.hasFormat(QLatin1String(kMessageType)))
		return false;
	QByteArray bytes = data.data(QLatin1String(kMessageType));
	// A stream ends where the bytes do, whatever they claim.
	BMemoryIO stream(bytes.constData(), bytes.size());
	BMessage found;
	if (found.Unflatten(&stream) != B_OK)
		return false;
	*message = found;
	return true;
}


/// The name of a file on this machine, byte for byte; empty for any other URL.
QByteArray
PathOf(const QUrl& url)
{
	QString host = url.host();
	bool isHere = host.isEmpty() || host == QLatin1String("localhost")
		|| host.compare(QSysInfo::machineHostName(), Qt::CaseInsensitive) == 0;
	if (url.scheme() != QLatin1String("file") || !isHere)
		return QByteArray();
	return QByteArray::fromPercentEncoding(url.path(QUrl::FullyEncoded).toLatin1());
}


void
AddFiles(const BMessage& message, QMimeData* data)
{
	QByteArray list;
	entry_ref ref;
	for (int32 i = 0; message.FindRef("refs", i, &ref) == B_OK; i++) {
		BPath path(&ref);
		if (path.InitCheck() == B_OK)
			list += "file://" + QByteArray(path.Path()).toPercentEncoding("/") + "\r\n";
	}
	if (!list.isEmpty())
		data->setData(QLatin1String(kUrlListType), list);
}

} // namespace


bool
IsUsableDrop(const QMimeData& data)
{
	return data.hasFormat(QLatin1String(kMessageType)) || data.hasUrls() || data.hasText();
}


std::unique_ptr<BMessage>
MakeDropMessage(const QMimeData& data)
{
	auto message = std::make_unique<BMessage>(B_SIMPLE_DATA);
	if (FindWholeMessage(data, message.get())) {
		// No program may name a receiver of answers in another one.
		message->RemoveName(kDragReplyTo);
		return message;
	}
	for (const QUrl& url : data.urls()) {
		entry_ref ref;
		QByteArray path = PathOf(url);
		if (!path.isEmpty() && get_ref_for_path(path.constData(), &ref) == B_OK)
			message->AddRef("refs", &ref);
	}
	// Qt makes a text of the files' names where there is none.
	if (data.hasFormat(QLatin1String(kTextType)) || !message->HasRef("refs"))
		AddText(message.get(), data.text());
	return message;
}


status_t
ReadMimeData(const QMimeData& data, BMessage* message)
{
	message->MakeEmpty();
	AnswerClock asked;
	const QStringList formats = data.formats();
	if (formats.isEmpty())
		return asked.IsTimeout() ? B_TIMED_OUT : B_ENTRY_NOT_FOUND;
	if (FindWholeMessage(data, message))
		return B_OK;

	bool hasText = false;
	for (const QString& format : formats) {
		// Qt offers its own kind of image for every picture. What has no slash is no MIME type.
		if (!format.contains(QLatin1Char('/')) || format == QLatin1String("application/x-qt-image"))
			continue;
		// Text in all its other spellings is the same.
		bool isText = format.startsWith(QLatin1String(kTextType));
		if (isText && hasText)
			continue;
		AnswerClock clock;
		QByteArray bytes = isText ? data.text().toUtf8() : data.data(format);
		// Who has not answered once would be waited for with every form.
		if (bytes.isEmpty() && clock.IsTimeout())
			return B_TIMED_OUT;
		hasText = hasText || isText;
		message->AddData(isText ? kTextType : format.toUtf8().constData(), B_MIME_TYPE,
			bytes.constData(), bytes.size(), false);
	}
	return message->CountNames(B_ANY_TYPE) > 0 ? B_OK : B_ENTRY_NOT_FOUND;
}


QMimeData*
MakeMimeData(const BMessage& message)
{
	auto data = new QMimeData;
	std::vector<char> flat(message.FlattenedSize());
	if (message.Flatten(flat.data(), flat.size()) == B_OK)
		data->setData(QLatin1String(kMessageType), QByteArray(flat.data(), flat.size()));
	AddFiles(message, data);

	char* name;
	type_code type;
	int32 count;
	for (int32 i = 0; message.GetInfo(B_MIME_TYPE, i, &name, &type, &count) == B_OK; i++) {
		const void* bytes;
		ssize_t size;
		if (message.FindData(name, B_MIME_TYPE, &bytes, &size) != B_OK)
			continue;
		auto characters = static_cast<const char*>(bytes);
		if (strcmp(name, kTextType) == 0)
			data->setText(QString::fromUtf8(characters, size));
		else
			data->setData(QString::fromUtf8(name), QByteArray(characters, size));
	}
	return data;
}

} // namespace BPrivate
