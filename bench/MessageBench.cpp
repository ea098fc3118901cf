// SPDX-License-Identifier: MIT
// How long messages take: a form of a thousand components, written, read and searched.

#include <string>
#include <vector>

#include <Message.h>
#include <benchmark/benchmark.h>


namespace {

constexpr int kComponents = 1000;
constexpr int kProperties = 20;
constexpr int kEvents = 12;


std::string
Flat(const BMessage& message)
{
	std::string bytes(message.FlattenedSize(), '\0');
	message.Flatten(bytes.data(), ssize_t(bytes.size()));
	return bytes;
}


/// A form as the designer writes it: a message a component, with one for its properties in it and one
/// for its events.
BMessage
Form()
{
	BMessage collection('PCmp');
	for (int i = 0; i < kComponents; i++) {
		const std::string componentName = "Button" + std::to_string(i);
		BMessage properties('cprp');
		properties.AddString("Name", componentName.c_str());
		for (int k = 1; k < kProperties; k++) {
			properties.AddString(("Property" + std::to_string(k)).c_str(),
				("value " + std::to_string(i * k)).c_str());
		}
		BMessage events('evts');
		for (int k = 0; k < kEvents; k++)
			events.AddBool(("OnEvent" + std::to_string(k)).c_str(), k % 2 == 0);
		BMessage record('info');
		record.AddMessage("Properties", &properties);
		record.AddMessage("Events", &events);
		collection.AddMessage(componentName.c_str(), &record);
	}
	BMessage form('PFrm');
	form.AddMessage("Components", &collection);
	return form;
}


/// Reads everything in the order in which the designer does; returns how many values there were.
int
Walk(const BMessage& form)
{
	int values = 0;
	BMessage collection;
	form.FindMessage("Components", &collection);
	BMessage record;
	BMessage properties;
	BMessage events;
	char* name;
	type_code type;
	for (int32 i = 0; collection.GetInfo(B_MESSAGE_TYPE, i, &name, &type) == B_OK; i++) {
		if (collection.FindMessage(name, &record) != B_OK
			|| record.FindMessage("Properties", &properties) != B_OK
			|| record.FindMessage("Events", &events) != B_OK) {
			continue;
		}
		const char* text;
		for (int32 k = 0; properties.GetInfo(B_STRING_TYPE, k, &name, &type) == B_OK; k++)
			values += properties.FindString(name, &text) == B_OK ? 1 : 0;
		bool isSelected;
		for (int32 k = 0; events.GetInfo(B_BOOL_TYPE, k, &name, &type) == B_OK; k++)
			values += events.FindBool(name, &isSelected) == B_OK ? 1 : 0;
	}
	return values;
}

} // namespace


static void
BM_BuildForm(benchmark::State& state)
{
	for (auto _ : state)
		benchmark::DoNotOptimize(Form().FlattenedSize());
}
BENCHMARK(BM_BuildForm)->Unit(benchmark::kMillisecond);


static void
BM_FlattenForm(benchmark::State& state)
{
	const BMessage form = Form();
	std::string bytes(form.FlattenedSize(), '\0');
	for (auto _ : state)
		benchmark::DoNotOptimize(form.Flatten(bytes.data(), ssize_t(bytes.size())));
	state.SetBytesProcessed(int64_t(state.iterations() * bytes.size()));
}
BENCHMARK(BM_FlattenForm)->Unit(benchmark::kMicrosecond);


static void
BM_UnflattenForm(benchmark::State& state)
{
	const std::string bytes = Flat(Form());
	for (auto _ : state) {
		BMessage form;
		benchmark::DoNotOptimize(form.Unflatten(bytes.data()));
	}
	state.SetBytesProcessed(int64_t(state.iterations() * bytes.size()));
}
BENCHMARK(BM_UnflattenForm)->Unit(benchmark::kMicrosecond);


/// Everything that loading a form does with messages.
static void
BM_UnflattenAndWalkForm(benchmark::State& state)
{
	const std::string bytes = Flat(Form());
	for (auto _ : state) {
		BMessage form;
		form.Unflatten(bytes.data());
		if (Walk(form) != kComponents * (kProperties + kEvents))
			state.SkipWithError("values are missing");
	}
}
BENCHMARK(BM_UnflattenAndWalkForm)->Unit(benchmark::kMillisecond);


static void
BM_FindString(benchmark::State& state)
{
	BMessage properties;
	std::vector<std::string> names;
	for (int k = 0; k < kProperties; k++) {
		names.push_back("Property" + std::to_string(k));
		properties.AddString(names.back().c_str(), "value");
	}
	size_t next = 0;
	for (auto _ : state) {
		const char* value;
		benchmark::DoNotOptimize(properties.FindString(names[next].c_str(), &value));
		next = (next + 7) % names.size();
	}
}
BENCHMARK(BM_FindString);


static void
BM_ReplaceString(benchmark::State& state)
{
	BMessage properties;
	for (int k = 0; k < kProperties; k++)
		properties.AddString(("Property" + std::to_string(k)).c_str(), "value");
	const char* values[] = {"short", "a good deal longer"};
	size_t next = 0;
	for (auto _ : state) {
		benchmark::DoNotOptimize(properties.ReplaceString("Property3", values[next]));
		next ^= 1;
	}
}
BENCHMARK(BM_ReplaceString);


/// Per item, whatever their number: adding at the end takes no longer for a long list.
static void
BM_AddStringAtTheEnd(benchmark::State& state)
{
	for (auto _ : state) {
		BMessage message;
		for (int64_t i = 0; i < state.range(0); i++)
			message.AddString("list", "an item of the list");
	}
	state.SetItemsProcessed(state.iterations() * state.range(0));
}
BENCHMARK(BM_AddStringAtTheEnd)->Arg(1000)->Arg(100000);


/// A loop over the items of one field.
static void
BM_FindEveryString(benchmark::State& state)
{
	BMessage message;
	for (int64_t i = 0; i < state.range(0); i++)
		message.AddString("list", "an item of the list");
	for (auto _ : state) {
		const char* value;
		for (int32 i = 0; message.FindString("list", i, &value) == B_OK; i++)
			benchmark::DoNotOptimize(value);
	}
	state.SetItemsProcessed(state.iterations() * state.range(0));
}
BENCHMARK(BM_FindEveryString)->Arg(1000)->Arg(100000);

BENCHMARK_MAIN();
