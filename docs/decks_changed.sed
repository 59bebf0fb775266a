# What someone changed in the clamp's deck, for docs/decks.md.
21s/50\./50.5/
188s/70000\./7.1e4/
204a OVEN, 1, 1
205s/Name: Floor.*/The floor/
s/From 20 to 120/From 20 to 125/
s/^OVEN, 120\./OVEN, 125./
279s/12000/14000/
329s/6\./6.5/
361s/^6/8/
