# The installed designer with the example.
limit 60
wait-window Properties
wait-window Project
wait-window Components
save-png ${OUT}/components.png
wait-window Hello
save-png ${OUT}/form.png
wait-window Plimworks
save-png ${OUT}/main.png
save-screen ${OUT}/screen.png
quit
