// The text of a deck.
{"deck-unreadable",
 "A file of the deck can't be read: the deck itself, or one that it includes.",
 "Everything behind an include that is missing refers to things that aren't there, so one lost file brings "
 "many other errors.",
 "Check the path. An included file is looked for beside the file that includes it. --no-includes leaves "
 "includes shut on purpose."},
{"not-a-deck",
 "The file holds bytes that no text has.",
 "It is a results file, an archive or a deck in a wide encoding. Solvers read decks as plain text, byte by "
 "byte, and stop at the first zero byte.",
 "Save it as plain text (ASCII or UTF-8). Of UTF-16 every second byte is zero."},
{"line-too-long",
 "A line has more than a million bytes; what goes beyond is left out.",
 "No line of a deck is of that length, so line ends got lost on the way, or the file is none.",
 "Restore the line ends: see how the file was moved or made."},
{"include-in-circle",
 "A file includes itself, directly or through others, or files are nested without end.",
 "Reading would never end; a solver stops with an error or fills the disk.",
 "Take the include out of the inner file. A file that is needed several times may be included one time "
 "after another, but not within itself."},
{"include-without-file",
 "An include names no file.",
 "What was to be read there (a mesh, a material) is missing from the analysis.",
 "Write *Include, input=FILE, with the name in double quotes if it has commas or blanks."},
{"quote-left-open",
 "A double quote has no partner on its line.",
 "The name goes on to the end of the line, commas and all, so parameters behind it are part of the name.",
 "Add the second quote behind the name. Names can't have a quote in them."},
{"data-before-keyword",
 "Data stand before the first keyword.",
 "They belong to nothing, and a solver stops at once. Most often the first keyword lost its asterisk, or a "
 "comment has one asterisk in place of two.",
 "Begin the deck with a keyword such as *Heading; comments begin with **."},
{"keyword-without-name",
 "A keyword line has an asterisk and no keyword.",
 "It can't be told what the lines behind it are; solvers stop there.",
 "Write the keyword, or make the line a comment with two asterisks."},
{"parameter-without-name",
 "A parameter of a keyword line has no name: two commas in a row, or a sign of equality with nothing ahead "
 "of it.",
 "Some solvers pass over it, others stop, and a value without a name has no effect.",
 "Give the parameter its name, or delete the extra comma."},
{"keyword-left-open",
 "A keyword line ends with a comma, and no parameter follows on the next line.",
 "A comma at the end promises that the line goes on. The next line, a data line, is then read as "
 "parameters, and the data are short by one line.",
 "Delete the comma, or put the missing parameter behind it."},
{"comma-ahead",
 "A keyword line goes on, and the comma stands at the head of the next line.",
 "The language wants it at the end of the line that is continued. Readers that see no comma there take the "
 "next line for data.",
 "Move the comma to the end of the first line."},
{"line-over-limit",
 "A line is longer than the 256 bytes that the language allows.",
 "Solvers cut it off without a word, so that the last numbers or the end of a name are lost.",
 "Break the line behind a comma: keyword lines go on that way, and data lines hold a limited number of "
 "values anyway."},
{"tab-in-line",
 "A line has a tab.",
 "One reader counts it as a blank, another as a column of eight, some as part of a name: a set \"TOP\" and "
 "one with a tab behind it are two.",
 "Replace tabs by blanks."},
{"lone-carriage-return",
 "Lines end with a carriage return alone, as on computers of long ago.",
 "Many readers see one single line then, and read nothing but the first keyword.",
 "Turn the line ends into line feeds, with any editor."},
{"not-a-number",
 "A number is expected, and there is none.",
 "Solvers stop, or read a zero. An O for a 0, a decimal comma, or a column that slipped are what it is "
 "most often; with a decimal comma one number becomes two.",
 "Correct the field. Numbers have a point, and an exponent as in 1.5E-3."},
// Blocks.
{"block-left-open",
 "A part, an instance, the assembly, a step or a load case has no end.",
 "All that follows belongs to the block: a second part would lie within the first one, and the solver "
 "stops at the end of the file or long before.",
 "Add the line *End Part, *End Instance, *End Assembly, *End Step or *End Load Case where the block is "
 "over. A deck that was cut short shows the same."},
{"end-without-begin",
 "A block ends that hasn't begun.",
 "The line that begins it is lost or misspelt, so its content stands outside, where it means something "
 "else or nothing.",
 "Look for the beginning above, or delete the end that is one too many."},
{"keyword-out-of-place",
 "The keyword doesn't stand in blocks of this kind.",
 "Materials belong to the model, not into a part; loads into steps, sections to parts. A solver refuses it "
 "or, in a few cases, reads it as something for the whole model.",
 "Move the keyword, with its data, to the block that it belongs to."},
{"option-without-owner",
 "The keyword is an option of another that isn't there, as *Elastic without *Material.",
 "Options belong to the last owner above. Without one the data have no home; behind another owner they "
 "would be its.",
 "Put the option right behind its owner, with nothing but other options between."},
{"unknown-keyword",
 "The keyword is none that is known here.",
 "If it is misspelt, the solver stops at it. If it is one that this check has not heard of, nothing is "
 "wrong, but its data aren't checked either.",
 "Take the spelling of the hint. Blanks and capitals make no difference; an abbreviation does."},
{"name-missing",
 "A keyword that defines something gives it no name.",
 "Nothing can refer to it: a material or a set without a name is lost, and the solver stops.",
 "Add the parameter that the message names, such as name=, nset= or elset=."},
{"defined-twice",
 "A name is defined twice where names are unique.",
 "Some solvers stop, some join both definitions, some keep the last: another material or amplitude than "
 "the one that you look at.",
 "Rename or delete one. Files that are included twice do this to everything that they define."},
// References.
{"undefined-set",
 "Nothing defines the set that is referred to.",
 "A load, support or section on it acts on nothing; solvers stop with an error, often a long way behind "
 "the cause.",
 "Compare with the hint. From outside an instance the set is INSTANCE.SET. A set that other sets are made "
 "of has to be defined ahead of them."},
{"undefined-surface",
 "Nothing defines the surface that is referred to.",
 "Contact, ties, couplings and pressures need it; the solver stops.",
 "Compare with the hint, and note that a set of elements or nodes isn't a surface: *Surface makes one of "
 "it. Outside of the instance its name is INSTANCE.SURFACE."},
{"undefined-name",
 "Nothing defines the name of a material, amplitude, orientation, interaction or the like that is referred "
 "to.",
 "The solver stops where it is used; an amplitude that it doesn't find may also mean a load at full size "
 "at once.",
 "Take the name of the hint, or add the definition, in the deck or in a file that it includes."},
{"undefined-node",
 "There is no node of the label.",
 "An equation, load or set with it acts on nothing there, or is refused.",
 "Look which part has the label: outside of parts it is written INSTANCE.LABEL. After a new mesh, labels "
 "written by hand no longer fit."},
{"undefined-element",
 "There is no element of the label.",
 "A load, section or surface with it is refused, or leaves a hole.",
 "Take labels from the mesh that is in the deck, or better a set that the mesher makes."},
{"placement-wrong",
 "The lines that place an instance can't be read.",
 "The first line is a translation, the second, if there is one, two points of an axis and an angle in "
 "degrees. Otherwise the part stands somewhere else, and contacts and ties miss their partners.",
 "Give three numbers, and seven on the second line. The rotation comes after the translation, about an "
 "axis in the assembly."},
// Meshes.
{"repeated-node",
 "A label of a node stands twice in a mesh.",
 "The later coordinates count in most solvers, and elements that meant the first node are drawn to another "
 "place.",
 "Number the nodes anew, or delete the second line if both are the same. Files that are included twice do "
 "this to all nodes."},
{"repeated-element",
 "A label of an element stands twice in a mesh.",
 "One of the two replaces the other: a hole in the structure, or a stop.",
 "Number the elements of one block anew; blocks of different types share one numbering within a part."},
{"element-without-node",
 "An element has a node that the mesh doesn't have.",
 "It can't be assembled; solvers stop. Nodes were deleted, or an include with them is missing.",
 "Add the node, or delete the element. Within a part only the part's own nodes count."},
{"element-node-count",
 "The connectivity of elements has another number of nodes than their type takes.",
 "The solver takes nodes by count: with too few it goes on reading in the next line, and every element "
 "behind it is wrong.",
 "Change the type to one of that many nodes. An element that needs two lines has a comma at the end of the "
 "first."},
{"element-without-type",
 "A block of elements has no type.",
 "Without it the number of nodes and all physics are unknown; the solver stops.",
 "Add type= to the line *Element."},
{"element-without-section",
 "The deck has elements that no section names.",
 "They have neither material nor stiffness: solvers stop in the data check.",
 "Add a section that names a set with these elements, or delete the elements, which are often boundary "
 "cells of a mesher."},
{"section-without-material",
 "A section has neither a material nor a behaviour.",
 "Its elements have no stiffness, and the solver stops.",
 "Add material=, or behavior= for connectors and gaskets. A beam section of given moduli needs none."},
{"empty-set-in-deck",
 "A set has no members.",
 "What refers to it acts on nothing, and some solvers stop. It often comes of a range that runs backwards "
 "or of sets that are empty in turn.",
 "Fill the set, or delete it with its references."},
{"range-endless",
 "A range of labels has no end, or none that is near.",
 "The three numbers are first, last and step. A step of zero, or a last label of thousands of millions, "
 "would make a set that fills the memory.",
 "Write first, last, step in this order, with the last no less than the first."},
{"node-columns",
 "A node has more than a label and three coordinates.",
 "More numbers are the components of a normal, which some elements take for the direction of a shell or "
 "beam; else a column has slipped and the coordinates are others.",
 "Check the columns: label, x, y, z."},
{"label-not-positive",
 "A label isn't a whole number from 1.",
 "Solvers refuse zero and negative labels; counting from 0 is what other programs do.",
 "Add one to all labels, in elements and sets too."},
// Flat decks.
{"flat-left-out",
 "A flat deck can't say something that the deck with parts says.",
 "The flat deck stands for the structure without it: a part without an instance, coordinates in a system "
 "of their own, axes of an inertia that turn with the instance.",
 "Look at the line that is named, and add by hand what your analysis needs."},
{"flat-as-it-stands",
 "The keyword is taken over as it stands, though it may name labels or directions.",
 "In a flat deck nodes and elements have new labels, and turned instances new directions. Numbers within "
 "this keyword still mean the old ones.",
 "Compare its data with the new labels, which the flat deck's sets show, and correct them by hand."},
{"flat-labels-run-out",
 "There are more labels than numbers for them.",
 "In a flat deck the nodes of all instances share one numbering up to 2147483647, and each instance begins "
 "behind the one before it; large labels in parts use it up.",
 "Number the parts from 1 without gaps, then flatten again."},
