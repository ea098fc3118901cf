# A user of the hello program: greets, counts, opens another form, and quits.
wait-window Hello
print-view GreetingText
click-view NameField
type "World"
expect-view GreetingText "Hello, World!"
click-view ShoutBox
expect-view GreetingText "HELLO, WORLD!"
print-view CountText
click-view CountButton
expect-view CountText "1 click"
click-view CountButton
click-view CountButton
expect-view CountText "3 clicks"
print-view CountText
save-png ${PICTURES}/hello.png

# Several notes may be open; each closes alone.
click-view NoteButton
wait-window Note
type "remember this"
expect-view NoteField "remember this"
click-view CloseButton
wait-no-window Note

wait-window Hello
click-view QuitButton
wait-no-window Hello
