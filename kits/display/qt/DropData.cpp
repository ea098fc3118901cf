// SPDX-License-Identifier: MIT
// What other programs drop or put on the clipboard, as messages, and back.
#include "display/qt/DropData.h"

#include <QByteArray>
#include <QMimeData>
#include <QUrl>

#include <Entry.h>
#include <Message.h>

namespace BPrivate {

namespace {

const char* const kTextType = "text/plain";


void
AddText(BMessage* message, const QString& text)
{
	QByteArray utf8 = text.toUtf8();
	message->AddData(kTextType, B_MIME_TYPE, utf8.constData(), utf8.size(), false);
}

} // namespace


bool
IsUsableDrop(const QMimeData& data)
{
	return data.hasUrls() || data.hasText();
}


std::unique_ptr<BMessage>
MakeDropMessage(const QMimeData& data)
{
	auto message = std::make_unique<BMessage>(B_SIMPLE_DATA);
	for (const QUrl& url : data.urls()) {
		entry_ref ref;
		QByteArray path = url.toLocalFile().toUtf8();
		if (!path.isEmpty() && get_ref_for_path(path.constData(), &ref) == B_OK)
			message->AddRef("refs", &ref);
	}
	if (data.hasText())
		AddText(message.get(), data.text());
	return message;
}


status_t
ReadMimeData(const QMimeData& data, BMessage* message)
{
	message->MakeEmpty();
	if (data.hasText())
		AddText(message, data.text());
	for (const QString& format : data.formats()) {
		// Text in all its other spellings is there already; what has no slash is no MIME type.
		bool isText = format.startsWith(QLatin1String(kTextType));
		if (isText || !format.contains(QLatin1Char('/')))
			continue;
		QByteArray bytes = data.data(format);
		message->AddData(
			format.toUtf8().constData(), B_MIME_TYPE, bytes.constData(), bytes.size(), false);
	}
	return message->CountNames(B_ANY_TYPE) > 0 ? B_OK : B_ENTRY_NOT_FOUND;
}


QMimeData*
MakeMimeData(const BMessage& message)
{
	auto data = new QMimeData;
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
