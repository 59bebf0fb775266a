// The text of a deck.
{"deck-unreadable",
 "A file of the deck can't be read: the deck itself, or one that it includes. The message names it, and the "
 "line of the include if there is one.",
 "Everything behind an include that is missing refers to things that aren't there, so one lost file brings "
 "many other errors.",
 "Check the path. An included file is looked for beside the file that includes it. --no-includes leaves "
 "includes shut on purpose."},
{"not-a-deck",
 "The file holds bytes that no text has. The reader met a zero byte; the rest of the file wasn't looked at.",
 "It is a results file, an archive or a deck in a wide encoding. Solvers read decks as plain text, byte by "
 "byte, and stop at the first zero byte.",
 "Save it as plain text (ASCII or UTF-8). Of UTF-16 every second byte is zero. Editors offer the encoding "
 "where a file is saved."},
{"line-too-long",
 "A line has more than a million bytes; what goes beyond is left out. A line ends with a line feed, alone "
 "or behind a carriage return.",
 "No line of a deck is of that length, so line ends got lost on the way, or the file is none.",
 "Restore the line ends: see how the file was moved or made. A transfer as text between systems, or a "
 "script that joined lines, does such things."},
{"include-in-circle",
 "A file includes itself, directly or through others, or files are nested without end. At most 64 files may "
 "stand one in the other, and 100000 includes in all.",
 "Reading would never end; a solver stops with an error or fills the disk.",
 "Take the include out of the inner file. A file that is needed several times may be included one time "
 "after another, but not within itself."},
{"include-without-file",
 "An include names no file. Its parameter \"input\" is missing or empty.",
 "What was to be read there (a mesh, a material) is missing from the analysis. The names that the missing "
 "file defines are then told of as undefined, one after the other.",
 "Write *Include, input=FILE, with the name in double quotes if it has commas or blanks."},
{"quote-left-open",
 "A double quote has no partner on its line. Names with blanks or commas in them stand between two of them.",
 "The name goes on to the end of the line, commas and all, so parameters behind it are part of the name.",
 "Add the second quote behind the name. Names can't have a quote in them. A name that needs no quotes may "
 "do without both of them."},
{"data-before-keyword",
 "Data stand before the first keyword. A line counts as data unless it begins with an asterisk.",
 "They belong to nothing, and a solver stops at once. Most often the first keyword lost its asterisk, or a "
 "comment has one asterisk in place of two.",
 "Begin the deck with a keyword such as *Heading; comments begin with **. A heading of a program, or a "
 "mail's first lines, may simply be deleted."},
{"keyword-without-name",
 "A keyword line has an asterisk and no keyword. The asterisk stands alone, or with nothing but blanks or a "
 "comma behind it.",
 "It can't be told what the lines behind it are; solvers stop there. Data that follow would be taken for "
 "those of the keyword before.",
 "Write the keyword, or make the line a comment with two asterisks. A line of asterisks as an ornament "
 "needs nothing: it begins with two."},
{"parameter-without-name",
 "A parameter of a keyword line has no name: two commas in a row, or a sign of equality with nothing ahead "
 "of it.",
 "Some solvers pass over it, others stop, and a value without a name has no effect.",
 "Give the parameter its name, or delete the extra comma. If a name with a comma was meant, put it between "
 "double quotes."},
{"keyword-left-open",
 "A keyword line ends with a comma, and no parameter follows on the next line. What follows instead doesn't "
 "begin with a letter, as every parameter does.",
 "A comma at the end promises that the line goes on. The next line, a data line, is then read as "
 "parameters, and the data are short by one line.",
 "Delete the comma, or put the missing parameter behind it. Data lines may end with a comma; it is keyword "
 "lines that mustn't."},
{"comma-ahead",
 "A keyword line goes on, and the comma stands at the head of the next line. So the line before ends as if "
 "nothing came behind it.",
 "The language wants it at the end of the line that is continued. Readers that see no comma there take the "
 "next line for data.",
 "Move the comma to the end of the first line. Programs that write decks by columns, and editors that wrap "
 "lines, leave it there."},
{"line-over-limit",
 "A line is longer than the 256 bytes that the language allows. Comments may be as long as they like.",
 "Solvers cut it off without a word, so that the last numbers or the end of a name are lost.",
 "Break the line behind a comma: keyword lines go on that way, and data lines hold a limited number of "
 "values anyway."},
{"tab-in-line",
 "A line has a tab. Comments aren't looked at: what stands in them is read by nobody.",
 "One reader counts it as a blank, another as a column of eight, some as part of a name: a set \"TOP\" and "
 "one with a tab behind it are two.",
 "Replace tabs by blanks. Editors do it for a whole file, and columns then stand where they look to be."},
{"lone-carriage-return",
 "Lines end with a carriage return alone, as on computers of long ago. Where others look for line feeds, "
 "each line then goes on into the next one.",
 "Many readers see one single line then, and read nothing but the first keyword. This program takes them "
 "for line ends, so what it says of the rest holds for the deck that was meant.",
 "Turn the line ends into line feeds, with any editor."},
{"not-a-number",
 "A number is expected, and there is none. The message shows the line, or the piece of it.",
 "Solvers stop, or read a zero. An O for a 0, a decimal comma, or a column that slipped are what it is most "
 "often; with a decimal comma one number becomes two.",
 "Correct the field. Numbers have a point, and an exponent as in 1.5E-3."},
// Blocks.
{"block-left-open",
 "A part, an instance, the assembly, a step or a load case has no end. Each is begun by a keyword of its "
 "own and ended by one with End in front.",
 "All that follows belongs to the block: a second part would lie within the first one, and the solver stops "
 "at the end of the file or long before.",
 "Add the line *End Part, *End Instance, *End Assembly, *End Step or *End Load Case where the block is "
 "over. A deck that was cut short shows the same."},
{"end-without-begin",
 "A block ends that hasn't begun. *End Part ends a part and *End Step a step; each of them needs the "
 "keyword without End above it.",
 "The line that begins it is lost or misspelt, so its content stands outside, where it means something else "
 "or nothing.",
 "Look for the beginning above, or delete the end that is one too many. A part that was copied from another "
 "deck may have left its first line there."},
{"keyword-out-of-place",
 "The keyword doesn't stand in blocks of this kind.",
 "Materials belong to the model, not into a part; loads into steps, sections to parts. A solver refuses it "
 "or, in a few cases, reads it as something for the whole model.",
 "Move the keyword, with its data, to the block that it belongs to. Look first whether a block above it was "
 "left open, or was closed too early."},
{"option-without-owner",
 "The keyword is an option of another that isn't there, as *Elastic without *Material.",
 "Options belong to the last owner above. Without one the data have no home; behind another owner they "
 "would be its.",
 "Put the option right behind its owner, with nothing but other options between. Comments may stand "
 "between. A keyword of another kind ends what belongs to the owner."},
{"unknown-keyword",
 "The keyword is none that is known here. It stands in no table of this program, whatever block it is in.",
 "If it is misspelt, the solver stops at it. If it is one that this check has not heard of, nothing is "
 "wrong, but its data aren't checked either.",
 "Take the spelling of the hint. Blanks and capitals make no difference; an abbreviation does."},
{"name-missing",
 "A keyword that defines something gives it no name. Its parameter isn't there, or has no value behind the "
 "sign of equality.",
 "Nothing can refer to it: a material or a set without a name is lost, and the solver stops.",
 "Add the parameter that the message names, such as name=, nset= or elset=. Its value is what the lines "
 "that refer to it say."},
{"defined-twice",
 "A name is defined twice where names are unique. The message tells the second definition and its line.",
 "Some solvers stop, some join both definitions, some keep the last: another material or amplitude than the "
 "one that you look at.",
 "Rename or delete one. Files that are included twice do this to everything that they define."},
// References.
{"undefined-set",
 "Nothing defines the set that is referred to. It is looked for in the block of the line, then where the "
 "language looks next.",
 "A load, support or section on it acts on nothing; solvers stop with an error, often a long way behind the "
 "cause.",
 "Compare with the hint. From outside an instance the set is INSTANCE.SET. A set that other sets are made "
 "of has to be defined ahead of them."},
{"undefined-surface",
 "Nothing defines the surface that is referred to. A surface is defined by the keyword *Surface and by "
 "nothing else.",
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
 "There is no node of the label. It is looked for in the part or the assembly that the line stands in.",
 "An equation, load or set with it acts on nothing there, or is refused. A part beside this one may well "
 "have such a node, and isn't meant.",
 "Look which part has the label: outside of parts it is written INSTANCE.LABEL. After a new mesh, labels "
 "written by hand no longer fit."},
{"undefined-element",
 "There is no element of the label. It is looked for in the part or the assembly that the line stands in.",
 "A load, section or surface with it is refused, or leaves a hole. A pressure with a hole in it changes the "
 "sum of the reactions, and little else.",
 "Take labels from the mesh that is in the deck, or better a set that the mesher makes."},
{"placement-wrong",
 "The lines that place an instance can't be read.",
 "The first line is a translation, the second, if there is one, two points of an axis and an angle in "
 "degrees. Otherwise the part stands somewhere else, and contacts and ties miss their partners.",
 "Give three numbers, and seven on the second line. The rotation comes after the translation, about an "
 "axis in the assembly."},
// Meshes.
{"repeated-node",
 "A label of a node stands twice in a mesh. The message tells the label and the second place.",
 "The later coordinates count in most solvers, and elements that meant the first node are drawn to another "
 "place.",
 "Number the nodes anew, or delete the second line if both are the same. Files that are included twice do "
 "this to all nodes."},
{"repeated-element",
 "A label of an element stands twice in a mesh. Elements of another type count too: a shell and a solid "
 "can't have one label.",
 "One of the two replaces the other: a hole in the structure, or a stop. Sets and loads that name the label "
 "act on the one that is left.",
 "Number the elements of one block anew; blocks of different types share one numbering within a part."},
{"element-without-node",
 "An element has a node that the mesh doesn't have. The message names both, and a node that several "
 "elements share is told of with each of them.",
 "It can't be assembled; solvers stop. Nodes were deleted, or an include with them is "
 "missing. A program that wrote elements before it wrote their nodes leaves such a deck when it is cut short.",
 "Add the node, or delete the element. Within a part only the part's own nodes count."},
{"element-node-count",
 "The connectivity of elements has another number of nodes than their type takes.",
 "The solver takes nodes by count: with too few it goes on reading in the next line, and every element "
 "behind it is wrong.",
 "Change the type to one of that many nodes. An element that needs two lines has a comma at the end of the "
 "first."},
{"element-without-type",
 "A block of elements has no type. Its keyword line lacks the parameter that says what the rows of labels "
 "are.",
 "Without it the number of nodes and all physics are unknown; the solver stops. Rows of eight labels may be "
 "bricks for stress, for heat or for sound, or shells of eight nodes.",
 "Add type= to the line *Element. Other blocks of the same file, or the program that wrote it, tell which."},
{"element-without-section",
 "The deck has elements that no section names. The message counts them by type and tells the first label.",
 "They have neither material nor stiffness: solvers stop in the data check. Types that need no section "
 "aren't counted.",
 "Add a section that names a set with these elements, or delete the elements, which are often boundary "
 "cells of a mesher."},
{"section-without-material",
 "A section has neither a material nor a behaviour. Its keyword line lacks the parameter that says what the "
 "elements are made of.",
 "Its elements have no stiffness, and the solver stops. What its data line says, a thickness or an area, "
 "changes nothing in that.",
 "Add material=, or behavior= for connectors and gaskets. A beam section of given moduli needs none."},
{"empty-set-in-deck",
 "A set has no members. The keyword is there, with no data lines or with lines that name nothing.",
 "What refers to it acts on nothing, and some solvers stop. It often comes of a range that runs backwards "
 "or of sets that are empty in turn.",
 "Fill the set, or delete it with its references. A group of the mesher that lost its cells is filled there."},
{"range-endless",
 "A range of labels has no end, or none that is near. It is one of the lines behind the parameter generate.",
 "The three numbers are first, last and step. A step of zero, or a last label of thousands of millions, "
 "would make a set that fills the memory.",
 "Write first, last, step in this order, with the last no less than the first. A range of one label has it "
 "twice. A step that is left out is 1."},
{"node-columns",
 "A node has more than a label and three coordinates. A line of *Node has at most four fields, the label "
 "among them.",
 "More numbers are the components of a normal, which some elements take for the direction of a shell or "
 "beam; else a column has slipped and the coordinates are others.",
 "Check the columns: label, x, y, z."},
{"label-not-positive",
 "A label isn't a whole number from 1. It is the first number of a line of nodes or elements.",
 "Solvers refuse zero and negative labels; counting from 0 is what other programs do.",
 "Add one to all labels, in elements and sets too. Where results go back to the other program, take one "
 "away again there."},
// Flat decks.
{"flat-left-out",
 "A flat deck can't say something that the deck with parts says.",
 "The flat deck stands for the structure without it: a part without an instance, coordinates in a system of "
 "their own, axes of an inertia that turn with the instance.",
 "Look at the line that is named, and add by hand what your analysis needs. If that can't be said in a flat "
 "deck, leave the deck as it is: solvers read parts."},
{"flat-as-it-stands",
 "The keyword is taken over as it stands, though it may name labels or directions.",
 "In a flat deck nodes and elements have new labels, and turned instances new directions. Numbers within "
 "this keyword still mean the old ones.",
 "Compare its data with the new labels, which the flat deck's sets show, and correct them by hand."},
{"flat-labels-run-out",
 "There are more labels than numbers for them. Each node of each instance has a label of its own there, and "
 "so has each element.",
 "In a flat deck the nodes of all instances share one numbering up to 2147483647, and each instance begins "
 "behind the one before it; large labels in parts use it up.",
 "Number the parts from 1 without gaps, then flatten again."},
