// Rules of single records.
{"beam-without-moduli",
 "A general beam section, whose stiffness is worked out ahead of the analysis, has a section but no row of "
 "Young's modulus and shear modulus.",
 "Such a section refers to no material: the data line with the moduli is where the solver takes its "
 "stiffness from. Without it the solver stops at the section, or takes the next line for it.",
 "Give \"materialTable\" one row, with Young's modulus, shear modulus and what else the message lists, or "
 "integrate the section during the analysis, so that it takes a material."},
{"empty-material",
 "A material has a name and no option: no elasticity, no density, nothing.",
 "The deck gets its name alone. Solvers refuse elements whose material has no behaviour for the procedure, "
 "and most often an empty material is the trace of an option that was misspelt or given to another name.",
 "Give the material what its elements need, such as \"elastic\" and, for dynamics or gravity, \"density\". "
 "If nothing refers to it, delete it."},
{"mixed-units",
 "Density and modulus of a material look like numbers in kg, m and Pa, as steel's 7850 and 2.1e11; meshes "
 "are often drawn in mm.",
 "Solvers know no units. Lengths in mm beside a modulus in Pa make a structure a million times too stiff "
 "under forces in N, and its masses wrong by 10^9; a plot of the deformed shape, which is scaled, looks "
 "right all the same.",
 "Take one system for everything: N, m, s (modulus in Pa, density in kg/m3) with all lengths in m, or N, "
 "mm, s (modulus in MPa, density in t/mm3, steel: 210000 and 7.85e-9). \"scale\" beside a mesh file turns "
 "its lengths."},
{"not-positive",
 "A number that means a stiffness, a density, a thickness or an interval is zero or negative.",
 "A zero density gives an infinite wave speed, a zero modulus a singular stiffness, a zero interval no end "
 "of output. Solvers stop at some of these and divide by others.",
 "Look for a swapped column or a lost exponent in the row that the message names. What is to be absent is "
 "left out rather than set to zero."},
{"poisson-ratio",
 "Poisson's ratio of an isotropic elasticity lies outside of -1 to 0.5.",
 "Beyond these limits shear or bulk modulus is negative, the material gives energy when it is loaded, and "
 "the solution is meaningless or doesn't converge. At 0.5 it is incompressible, and elements lock unless "
 "they are hybrid.",
 "Most often the columns are swapped: modulus first, then the ratio. Rubber takes 0.499 at most with "
 "ordinary elements, or hybrid ones (a type that ends in H)."},
{"basic-beside-assembled",
 "A connector section names an assembled connection type, such as a beam or a hinge, and basic types "
 "beside it.",
 "An assembled type stands for a translational and a rotational basic type already, so the deck names it "
 "alone and the basic ones are lost.",
 "Take the assembled type away and name both basic types, or the other way round, depending on which "
 "components are to stay free."},
{"cannot-be-written",
 "The model holds an object of which no deck can be written: the writer stops at it with the text that is "
 "quoted.",
 "Nothing can be analysed before it is gone, since a run of \"write\" fails with exit code 4 and leaves an "
 "older deck as it was.",
 "Replace or suppress the object. The message says in which step and why: a procedure or a shell that has "
 "no keyword, a state that can't be ended, a section that doesn't fit. Often an allied class does the "
 "same, such as another frequency procedure."},
{"cut-to-integer",
 "A number with a fraction stands where the deck has a whole one; the fraction is cut off, not rounded.",
 "3.9 becomes 3. In time incrementation that changes how many iterations or cutbacks are allowed; in the "
 "scaling of a section it changes the result.",
 "Write the whole number that is meant. Counts of iterations that were worked out elsewhere are rounded up "
 "by hand, so that no fewer are allowed."},
{"keyword-in-text",
 "A line of a description begins with an asterisk.",
 "Descriptions become lines of the deck just behind their keyword. One that begins with \"*\" is read as a "
 "keyword: at best the solver doesn't know it and stops, at worst it does and the step does something "
 "else.",
 "Put a word or a blank-free character ahead of the asterisk, or write a comment of two asterisks, if it "
 "is to be none of the description."},
{"law-unknown",
 "The type of a material law is the marker for \"unknown\". It stands for a choice that nobody has made yet.",
 "The parameter of the keyword line will hold the word unknown, which no solver has as a law, so it stops "
 "while reading the deck.",
 "Set \"type\" to the law that the data are for: for rubber for instance NEO_HOOKE, MOONEY_RIVLIN, OGDEN or "
 "YEOH."},
{"law-without-data",
 "A material law has neither constants nor test data that would be written. A law is its type and its data; "
 "of this one only the type is there.",
 "Its keyword will stand there without data lines. The solver reads the next keyword where it expects "
 "coefficients and stops.",
 "Give \"table\" a row of constants, or turn on the use of test data and give the tests: uniaxial, biaxial, "
 "planar or volumetric."},
{"list-not-written",
 "A list is longer than the deck has places for, and then none of it is written. The list counts by place, "
 "and the deck's line has so many places and no more.",
 "What you gave is lost as a whole and the solver's defaults take its place, for instance all control "
 "parameters of a step.",
 "Shorten the list to the number that the message names; values at its end that are the defaults can be "
 "left out."},
{"list-too-long",
 "A list has more entries than there are things that they belong to.",
 "Entries count by their place: the third belongs to the third pair, mode set or component. One too many "
 "shows that the lists have slipped, so that earlier entries may belong to the wrong ones as well.",
 "Compare both lists from the beginning, then drop what is over or add what is missing in the other."},
{"load-cases-not-allowed",
 "A step has load cases, and its procedure knows none.",
 "Load cases are alternatives of a linear solution: static perturbation and direct steady-state steps "
 "factor the stiffness once and solve for each. In a general step the loads act together, so the cases "
 "would be lost.",
 "Make the step a static perturbation one, or give each case a step of its own. In steps of their own, take "
 "the loads of one case away before those of the next begin."},
{"missing-field",
 "A member is missing, or null, that the object can't do without.",
 "There is no default that would be true of most models: a section without its material or an instance "
 "without its part has no meaning, so the model is refused.",
 "Add the member that the pointer ends with; the message says what is expected. \"qrxdeck schema\" "
 "describes all members, and editors complete them from it."},
{"name-in-deck",
 "A name can't stand in a deck: it is empty, has a double quote or a control character, or more than 80 "
 "bytes.",
 "Names are parameters of keyword lines. A quote ends them early, a line end begins a line of its own, and "
 "solvers cut names that are longer, which makes two of them one.",
 "Rename the object and all that refer to it. Blanks, dots and other letters are allowed; the deck puts "
 "such names into quotes."},
{"negative-number",
 "A number that counts or measures something is negative. Such are numbers of increments, iterations, "
 "intervals and modes, sizes, and coefficients of friction.",
 "There is no such thing as minus three increments or a negative friction; the solver stops, or reads "
 "another meaning into the sign.",
 "Correct the sign. If the member is to be as if it weren't there, leave it out and its default counts."},
{"negative-tolerance",
 "A length or a tolerance within which things are looked for is negative. Tolerances of a submodel's driven "
 "nodes, and the thickness of its shell, are such numbers.",
 "Searches with it find nothing, or the solver takes its default, so that the driven nodes of a submodel or "
 "the partners of a tie are others than you think.",
 "Give a positive length, of the order of half an element, or leave the member out."},
{"no-direction",
 "Two points that are to give an axis or a direction are one and the same. A centrifugal load turns about "
 "such an axis, and a surface traction acts along such a direction.",
 "The direction is the line from one to the other. With a distance of zero it has none; solvers divide by "
 "its length.",
 "Set the second point apart from the first, anywhere on the axis. How far makes no difference."},
{"no-label",
 "The data line of a load lacks the label that says what kind of load it is.",
 "The line then is region, blank, magnitude. Solvers stop at the blank label, or take the magnitude for "
 "it.",
 "Choose a distribution that decks have a label for, such as UNIFORM with the force divided by the area in "
 "place of TOTAL_FORCE, or say whether a body force is centrifugal or rotary."},
{"not-an-integer",
 "A number isn't whole, or is beyond 32 bits, where the deck has a whole one. In a model file it may have "
 "come from a table or a script that writes every number with a point.",
 "Counts and labels are read as integers. A text like 1e10 or 2.5 stops the solver or is read as its first "
 "digits.",
 "Write a whole number within plus and minus 2147483647."},
{"not-in-deck",
 "A value is given, and what stands beside it keeps it out of the deck.",
 "The analysis will run without it, and nothing in the deck shows that you wanted it: a type that has no "
 "place for the field, a table that is switched off, a job setting that belongs on the command line.",
 "The message says what keeps it out and what to do instead. If the value was a leftover, delete it."},
{"number-too-small",
 "A number is below the least that makes sense. Terms of a series count from one, as do field variables, of "
 "which the deck says which one is meant.",
 "A series needs so many terms, a field variable so many places; the solver refuses less.",
 "Take at least the number that the message names. Counts of variables go from 1."},
{"orientation-name",
 "An orientation of a connector has a name of its own, while the deck defines it under a name that is made "
 "from its place.",
 "Where an angle other than zero stands, the connector section refers to the made name. Two names for one "
 "system make the deck hard to follow, and text that you wrote with your name finds nothing.",
 "Leave the name out; the deck's name begins with \"ConnOri-\"."},
{"range-turned",
 "The lower end of a range lies above its upper end. Lower and upper frequency of an extraction are meant, "
 "or the first and the last mode that a damping holds for.",
 "A range that runs backwards is empty: no eigenvalue lies in it, no mode is damped. Solvers refuse it or "
 "pass over it without a word.",
 "Exchange the two numbers. For a single frequency or mode both are the same."},
{"step-times",
 "Period, initial, least and greatest increment of a step contradict one another.",
 "An initial increment beyond the period or the greatest is cut by the solver; a least one above the "
 "initial stops the first cutback, which looks like a model that doesn't converge.",
 "Keep least <= initial <= greatest <= period. For a nonlinear step an initial increment of a tenth of the "
 "period, and a least one of 1e-5 of it, are a fair start."},
{"suppressed-step",
 "A step is marked as suppressed, and the deck has it all the same.",
 "States of conditions build on one another from step to step, so a step can't be taken out without "
 "deciding what becomes of them; the mark alone does nothing, and the solver will run the step.",
 "Delete the step, and put what it begins into the next one, or drop the mark. On a load, a condition or an "
 "interaction the mark does count: what has it is left out of the deck."},
{"table-columns",
 "The rows of a table have another number of columns than the flags beside it call for.",
 "Each flag adds columns: temperature dependence one, field variables one each, anisotropy several. A "
 "wrong width shifts values into the wrong meaning, a modulus into the temperature; so the model is "
 "refused.",
 "Count the columns that the message lists, in that order, and correct the flag or the rows."},
{"table-numbers",
 "A table has fewer numbers than the rule takes that it is for. The message says how many are there, and "
 "how many the law has.",
 "An exponential law, of softened contact or of friction that decays, is defined by a fixed number of "
 "coefficients; the solver reads past the end of too few.",
 "Give all numbers in the order that the message names. A number that is to be without effect still has its "
 "place in the row."},
{"table-rows",
 "A table has fewer rows than are needed. The message says how many there are and how many are needed at "
 "least.",
 "A curve needs two points to be one, a segment two ends, and a law with dependencies a first row on the "
 "keyword's own line.",
 "Add the rows. For a value that is constant one row is enough wherever the message says \"at least 1\"."},
{"table-width",
 "The rows of a table have another length than the flags and the type of the law stand for.",
 "The deck gets the numbers as they are, and the solver reads them by its own count: of a row that is too "
 "short it takes zeros, of one too long the rest for temperature or field variables.",
 "Compare the row with the list in the message. Often the type is wrong (isotropic data under an "
 "anisotropic type) or a temperature column lacks its flag."},
{"text-in-deck",
 "A text has a line end, a tab or another control character, where the deck has one line.",
 "What comes behind a line end would be a line of its own in the deck, read as data or as a keyword.",
 "Keep the text on one line. Deck text of several lines goes where it belongs, such as \"solverInput\", or "
 "into a description."},
{"wrong-component",
 "A component of a connector isn't a number from 1 to 6, or stands twice.",
 "Components are the relative motions: 1 to 3 translations, 4 to 6 rotations about the local axes. Any "
 "other has no meaning, and one that is given twice has two behaviours.",
 "Take each of 1 to 6 at most once, and only those that the connection type leaves free."},
{"wrong-distribution",
 "The class of the load or field has no form for this distribution.",
 "The deck writes it as what the message says, most often as uniform, so that a pressure which should grow "
 "with depth is constant: reactions are then wrong in size and place.",
 "Take the class that has the distribution (hydrostatic pressure belongs to pressures and pipe pressures), "
 "or describe it by a mapped or user-defined field."},
{"wrong-dof",
 "No degree of freedom of this kind has the number.",
 "Degrees of freedom are numbered: 1 to 6 motion, 8 pore or acoustic pressure, 9 electric potential, 11 and "
 "up temperatures. A flux on any other acts on nothing.",
 "Temperatures are 11 and, through the thickness of shells, 12, 13, and so on. To move or to hold a node, "
 "take a displacement condition; a force at a node is a concentrated force."},
// Rules of the whole model.
{"term-without-nodes",
 "A term of an equation counts its degree of freedom in a coordinate system, but its set is no node set of "
 "the assembly.",
 "The deck turns the nodes of that set into the system ahead of the equation. Without nodes of the "
 "assembly there is nothing to turn, and the term would count in global directions.",
 "Make a node set of the assembly that holds the node, and name it in the term, or leave the system out."},
// Model files, and data on their way into a store.
{"assembly-nodes",
 "Nodes stand in the mesh of the assembly itself, and no deck will have them.",
 "Decks are made of parts and instances; what belongs to neither is left out. Loads, couplings or springs "
 "on such nodes then name sets that the solver can't find.",
 "Make each a part with one node, a reference point, and an instance of that part; sets of the assembly "
 "can hold it together with others."},
{"capitals-only",
 "Two names differ in nothing but capital letters. \"TOP\" and \"Top\" are two sets in the model file, "
 "where capitals count.",
 "Solvers don't tell capitals apart: \"Steel\" and \"STEEL\" are one material there, and the second "
 "definition replaces the first or stops the run.",
 "Rename one of them, and what refers to it. A number or a word at the end tells them apart for people too."},
{"duplicate-label",
 "A label of a node or an element stands twice in one mesh.",
 "Labels are how everything refers to nodes and elements. With two of the same, the solver keeps the later "
 "position or connectivity, and the structure is another one.",
 "Number anew in the mesher, or merge the two if they are meant to be one. Instances may have the same "
 "labels: each has a space of its own."},
{"duplicate-member",
 "An object of the file has two members of one name.",
 "Readers of JSON disagree about which counts, so the model would be another one in another program. Often "
 "it is a block that was copied and whose name wasn't changed.",
 "Rename the second, if both are meant, else delete it. Programs that read JSON and write it again keep one "
 "of the two without a word, so look at the text itself."},
{"duplicate-name",
 "A name stands twice where names are unique: sets of a mesh, steps, datums.",
 "Whatever refers to the name would reach one of the two, and nobody could say which.",
 "Rename one. If two sets of one name are to be one, put their members together. Names may well be the same "
 "in different places: two parts may each have a set named TOP."},
{"empty-entry",
 "An entry of a set of the assembly names an instance and no members of it. Each entry stands for an "
 "instance and for what of it belongs to the set.",
 "It adds nothing, so it is most likely a list that got lost, and a load or a tie will reach fewer nodes "
 "than it should.",
 "Give the entry its labels, or the name of a set of the instance, or delete the entry."},
{"empty-set",
 "A set has no members, and will not stand in the deck. It was made without any, or its group in the "
 "mesher's file had nothing left.",
 "Anything that refers to it names a set that the solver doesn't find, and it stops there. If nothing "
 "refers to it, all is well.",
 "Fill the set, or delete it together with what refers to it. After a new mesh, check whether the group of "
 "the mesher still has its name."},
{"idle-sector",
 "The model has a sector definition without a symmetry. Its symmetry type is NONE, so the number of sectors "
 "and the axis are there for nothing.",
 "The model is analysed as it stands, as one sector that is free at both sides, while its natural "
 "frequencies and stresses should be those of the whole ring.",
 "Set \"symmetryType\" to cyclic and tie the two sides of the sector with cyclic symmetry, or delete the "
 "definition."},
{"impossible-state",
 "An object is given a state in a step where it can't have one.",
 "States are kept from step to step: an object is created once, then modified or taken away. To modify "
 "ahead of creating, or in a step that the object doesn't know, can't be carried out.",
 "Look at \"qrxdeck info --history\" for what the object is in each step, and move the state to the step "
 "that is meant."},
{"inner-face",
 "Cells of a mesher's surface group lie between two solid elements.",
 "A face in the inside belongs to both elements, and a surface needs to know which. The one with the lower "
 "label is taken; its normal decides where a pressure or a contact acts.",
 "For an outer surface take the cells inside out of the group. For an interface between two bodies, make "
 "two groups on meshes that don't share their nodes."},
{"initial-step",
 "The first step isn't the initial one, or there is a second initial one. The first step of a model is of "
 "class InitialStep, and none behind it is.",
 "The initial step holds what is so before anything is analysed: supports, initial conditions, contact. It "
 "comes first, once, and has no procedure.",
 "Begin \"steps\" with one of class InitialStep, named \"Initial\", and make all others analysis steps."},
{"length-mismatch",
 "Two lists that belong together have different lengths: labels and coordinates, or labels and "
 "connectivity.",
 "From the first missing entry on each label would get the position of another; there is no telling which "
 "is missing.",
 "Make both lists from the same source. The message says how long each is and how many nodes an element of "
 "the type has."},
{"mesh-file",
 "A mesher's file can't be read, or can't become the mesh that the model asks for.",
 "The file is damaged, cut short, of an unknown version, or lacks the block, part or group that was asked "
 "for. Half a mesh would analyse half a structure.",
 "Try \"qrxdeck mesh FILE\" to see what the file holds. Export it anew, in a version that is supported, "
 "with elements of the orders that you want."},
{"mesh-file-note",
 "What was done to a mesher's mesh on its way: nodes that were merged, cells turned or left out, groups "
 "renamed, labels given.",
 "None of it is wrong, but the numbers of nodes and elements in the results are those after it. Cells of "
 "lower dimension that belong to no group are usually geometry that isn't analysed.",
 "Compare the counts with what the mesher shows. If cells are left out that you need, put them into a "
 "group."},
{"no-default-model",
 "The file has no model of the name that decks are written from. Decks are written from the only model of a "
 "file, whatever its name, and of several from the one named \"Default Model\".",
 "A file may hold several models, and one of them has to be chosen. To take any one of them would be a "
 "guess, and the deck of the wrong variant looks as right as the other.",
 "Rename the model that you mean, or choose one by its name."},
{"no-direction-csys",
 "The axes of a datum have no length, are parallel, or are too long for a number.",
 "A coordinate system is made of a first axis and a second one that lies in a plane with it. From parallel "
 "ones no plane follows, and every direction counted in it would be undefined.",
 "Give a second axis that isn't parallel to the first; it needn't be perpendicular or of unit length."},
{"no-such-face",
 "Elements of the type have no face of this name or number.",
 "A surface is made of elements and their faces; a face that isn't there carries no pressure and meets no "
 "contact.",
 "Solids and plane elements have S1 to S6, as many as they have sides; shells SPOS and SNEG, for their two "
 "sides; lines END1 and END2. The message tells the type."},
{"no-such-label",
 "A mesh has no node or element of the label.",
 "An element with a node that isn't there can't be assembled, and a set with one holds less than was "
 "meant. Solvers stop at the first and often only warn of the second.",
 "Labels changed, most likely, when the mesh was made anew. Export mesh and sets together, or refer to "
 "groups of the mesher's file, which follow."},
{"no-such-meaning",
 "A number stands where only some numbers have a meaning, and this is none of them.",
 "It reaches the deck or decides what is written, as something that nobody defined, and the default often "
 "isn't what happens then.",
 "Write the word rather than the number: words are checked, and readers understand them. \"qrxdeck "
 "schema\" lists them."},
{"no-such-name",
 "A name refers to nothing of its kind in the model. A material of a section is such a name, as are an "
 "amplitude of a load and the part of an instance.",
 "The deck would name a material, section, amplitude or instance that it doesn't define; a solver stops "
 "there at best. So the model is refused.",
 "Take the name that the hint proposes, or define the object. Capitals and blanks count here."},
{"no-such-place",
 "A pointer of a parameter leads to no value of the file. The members on the way to it, or the last one, "
 "aren't there.",
 "A study that varies the parameter would change nothing, or stop at its first row: all variants would be "
 "the same structure.",
 "Correct the pointer: members by name, entries of arrays by their place from 0, with \"/\" in a name "
 "written as ~1 and \"~\" as ~0."},
{"no-such-set",
 "The mesh, or the assembly, has no set of the name.",
 "What refers to it (a load, a support, a section) would act on nothing, and the solver refuses the deck.",
 "A set of an instance is named INSTANCE.SET, one of the assembly by its name alone; the message says "
 "where it was looked for. If it came from a mesher, see \"qrxdeck mesh\" for the groups."},
{"not-defined",
 "The model refers to an orientation or a filter that it doesn't define. Neither its datums nor its objects "
 "of that kind have the name.",
 "These may be defined by text that the model adds to the deck, so this is no error; if they aren't, the "
 "solver stops at the name.",
 "Define it as a datum or an object, or make sure that \"solverInput\" has its keyword with just this name."},
{"sets-in-assembly-mesh",
 "Sets stand within the mesh of the assembly. That mesh has nodes and elements alone; it may leave both out.",
 "Sets of the assembly may hold members of several instances, so they aren't those of one mesh and have a "
 "place of their own.",
 "Move them to the member \"sets\" of \"assembly\"; each entry of theirs names its instance."},
{"syntax",
 "The text is no JSON: a comma, bracket or quote is missing or one too many, or a number or word is "
 "broken.",
 "Nothing behind that place can be understood, so only the first such error is told.",
 "Look at the line and the one ahead of it, where a comma is often missing. Names and texts stand in "
 "double quotes; // comments are allowed, a comma behind the last entry is not."},
{"unknown-element-type",
 "The element type begins with no family that is known, and is taken for a point element.",
 "Faces, sections and degrees of freedom of it can't be checked, and surfaces on it can't be named. The "
 "deck gets the type as it stands, which is right for types that only the solver knows, and fatal for a "
 "misspelt one.",
 "Compare with the solver's list of elements: C3D8R, S4, B31, T3D2 and so on."},
{"unknown-member",
 "An object of the file has a member that means nothing there. It is misspelt, or belongs to another object "
 "than the one that it was written into.",
 "It would be passed over, and a value that you gave would have no effect, such as a density under a "
 "misspelt name. So the model is refused.",
 "Take the member of the hint. If it belongs one level up or down, move it. Notes for people go into "
 "comments or into \"description\"."},
{"unreadable-file",
 "The file can't be read; the message ends with what the system says. It may be missing, be a folder, or "
 "belong to somebody who doesn't let you read it.",
 "Without it there is nothing to do. For a mesh that a model names, its path counts from the model file's "
 "folder.",
 "Check the path, its capitals and the rights on the file and its folders. On the command line, a path "
 "counts from the folder that you are in."},
{"wrong-class",
 "The object of that name is of a class that can't stand here.",
 "A bolt load where a connector is needed, or a contact property for the solver of the other kind, would "
 "be written as a name that means something else to the solver.",
 "Refer to an object of the class that the message names, or change the object's class."},
{"wrong-format",
 "The member \"format\" doesn't say what this program reads.",
 "It is the promise that the members mean what is expected. A file without it may be anything, one of a "
 "later version may mean something else by the same word.",
 "Write \"format\": \"qrx-model/1\" at the top. A file that says another number was made for another "
 "version of the program."},
{"wrong-label",
 "A label isn't positive, or a range of labels runs backwards or is too long. Labels are whole numbers from "
 "1 to 2147483647; \"to\" of a range needn't be met exactly.",
 "Labels number nodes and elements from 1. A range that runs backwards is empty, and a set made of it has "
 "no members.",
 "Write \"from\" no greater than \"to\", and \"by\" as the distance. Labels of zero are usually indices of "
 "a program that counts from 0: add one."},
{"wrong-set-kind",
 "The set is of another kind than is needed: nodes, elements or a surface. The kind stands in the set "
 "itself, as \"node\", \"element\" or \"surface\".",
 "A section needs elements, a support nodes, a pressure a surface. The same name may be read as another set "
 "by the solver, or as none.",
 "Refer to a set of the right kind. Meshers' groups of boundary cells become surfaces, and their nodes can "
 "be had as a set of nodes too."},
{"wrong-value",
 "A value is of another type or length than the member takes, or none of the words that it knows.",
 "A text where a number stands can't be turned into one without guessing, and a guess may be off by a unit "
 "or a factor. So the model is refused.",
 "Give what the message expects. Words may be in any capitals; numbers stand without quotes; three "
 "coordinates are an array of three."},
// Meshes.
{"far-mid-sides",
 "Quadratic elements have mid-side nodes far from the middle of their edge.",
 "When such a node comes as near to an end as a quarter of the edge, strains there become infinite, as a "
 "crack tip element wants it; beyond, the element turns inside out. Stresses near it are wrong, and large "
 "deformation fails early.",
 "Let the mesher put the nodes onto straight edges, or smooth and refine where curved surfaces have coarse "
 "elements."},
{"inverted-elements",
 "Elements have a volume, area or length that is zero or negative.",
 "Their stiffness is zero or negative; solvers stop at them in the data check. One or two come from "
 "slivers of the mesher, all of them from another order of nodes than the deck's.",
 "Improve the mesh at the labels that are told. If all elements are meant, mirror the order of nodes, or "
 "look at the program that exported them."},
{"repeated-elements",
 "Elements have the same nodes as another element.",
 "Stiffness and mass count twice there: the part is stiffer and heavier than drawn, and pressure on it "
 "acts twice. It comes from bodies that were meshed twice or files that were joined.",
 "Delete one of each pair. Where two materials are meant to share nodes, as skin on a solid, the types "
 "differ and nothing is told."},
{"repeated-nodes",
 "Nodes lie at the place of another node.",
 "Between parts that meet in contact, at ties and at hinges that is as it should be. Within a part it is a "
 "crack that nobody sees: the elements on both sides aren't connected and open under load.",
 "Merge the nodes in the mesher where the part is to be one. A mode at frequency zero, or a gap in the "
 "deformed shape, tells the same."},
{"shared-faces",
 "Three or more solids have one face in common.",
 "In a proper mesh a face lies between two elements or outside. A third one means that bodies overlap, so "
 "stiffness, mass and contact there are counted more than once.",
 "Look for bodies that were meshed twice, or elements that were copied onto others, and delete the extra "
 "ones."},
{"unused-nodes",
 "Nodes belong to no element.",
 "Solvers take them along; without stiffness they matter only where a load or a support names them, as "
 "reference points do. Many of them are often what a mesher left of its geometry.",
 "Nothing, for reference points and centres. If there are many, export elements only, or clean the mesh; "
 "\"ignore\" in the model, with a reason, silences this."},
// What the deck can't say.
{"amplitude-too-short",
 "The points of an amplitude end before the step does.",
 "Behind the last point the last value stays: a load that was to come back to zero remains, and a shake "
 "that was recorded for two seconds is followed by a constant push.",
 "Add a last point at the end of the step, with the value that is meant, or end the step where the "
 "amplitude ends. Times may count from the step or from the beginning of the analysis: see its time span."},
{"conflicting-values",
 "Two conditions give one degree of freedom of a node different values in one step.",
 "Solvers take one of them, the later or the first, depending on kind and place, and don't always say so. "
 "The reaction and the shape then belong to a support that nobody chose.",
 "Take the shared nodes, often an edge or a corner, out of one of the two regions, or let only one of them "
 "act on this degree of freedom."},
{"contact-with-itself",
 "The two sides of a contact pair are the same faces. They may have two names: sets with the same members "
 "count as one.",
 "Every node would lie on its partner from the beginning, at distance zero to itself. Solvers refuse it or "
 "find no contact at all.",
 "Choose the other surface for one side. If a surface is to touch itself as it folds, take self-contact."},
{"dotted-set-name",
 "A name of a set has a dot in it.",
 "In decks a dot parts an instance from its set, so A.B is read as the set B of the instance A. The solver "
 "looks for that one, and doesn't find it or finds another.",
 "Replace the dot by a hyphen or an underscore, here and where the set is referred to."},
{"element-without-physics",
 "Elements lack the degrees of freedom that the procedure solves for, such as stress elements in a heat "
 "transfer step.",
 "They have no conductivity, no pressure, no temperature there. The solver refuses the combination, or "
 "leaves the elements out and the heat finds no way through them.",
 "Choose the type for the physics: DC3D8 for heat, C3D8T for both at once, AC3D8 for acoustics, with the "
 "same nodes. Or the procedure is not the one that is meant."},
{"fixed-and-loaded",
 "A load acts on a degree of freedom that a condition prescribes in the same step.",
 "The force goes straight into the support: it changes the reaction and nothing else. In most cases the "
 "load was to move something.",
 "Free that direction, move the load, or keep it if you want the reaction alone, as for the share of a "
 "support in a balance of forces."},
{"held-by-length",
 "A bolt load holds its bolt by its length, which decks tell in a comment only. Holding it there, and "
 "letting the force come of itself, is what a bolt does once it is tightened.",
 "The solver must be told to keep the length, or the bolt goes on carrying the force of the step before, as "
 "if somebody went on turning the nut.",
 "Compare the deck's lines of the bolt with what the solver wants. Usually the first step applies the "
 "force, all later ones fix the length."},
{"huge-deck",
 "The deck will be larger than a gigabyte. The message says how large. It is the size of the text that the "
 "model would become.",
 "Reading it takes the solver minutes and much memory, and most of it is often output requests or sets that "
 "are repeated, not the mesh.",
 "Nothing, if the mesh is meant to be so fine. Else see \"qrxdeck info\" for the counts of nodes and sets."},
{"material-lacks",
 "A material lacks a property that a procedure needs: density for dynamics, frequencies and gravity, "
 "conductivity for heat, specific heat for transients, expansion for thermal stress.",
 "Solvers stop, or take zero: no mass, no inertia, no weight, no thermal strain.",
 "Give the property, in the system of units of everything else. Leave the procedure's effect out if it "
 "isn't wanted: without gravity, for instance, statics needs no density."},
{"mixed-solvers",
 "Steps of the explicit and of the implicit solver stand in one job. Explicit dynamics is of the one; "
 "statics, frequencies, heat transfer and most others are of the other.",
 "A job is run by one of the two, and the other's procedures are unknown to it. It reads the deck up to the "
 "first of these, and stops there.",
 "Make two models. The second takes the state of the first as its initial state, such as springback behind "
 "forming."},
{"no-components",
 "A state gives no component, so its keyword has no line.",
 "The condition is there by name and holds or drives nothing; the structure is as free as without it. A "
 "free structure moves as a rigid body, and the solver tells of a singular matrix.",
 "Give at least one of the components a number: 0 holds it, leaving it out frees it."},
{"no-such-element-type",
 "The family of elements that the type begins with has no type of this name. The family tells what kind of "
 "element was meant, as C3D8 does of C3D8X.",
 "Integration, hybrid or thermal letters can't be combined freely: C3D8RH is one, C3D8RX is none. The "
 "solver stops at the line of the elements.",
 "Take one of the types that the message lists. If the solver has a type that this program doesn't know, "
 "the deck is right as it is."},
{"no-such-side",
 "A surface names a face that elements of the type don't have. Faces of solids and of plane elements are "
 "numbered S1, S2 and so on, by the sides of the cell.",
 "A tetrahedron has four sides, a wedge five. The solver stops at the face, or at the surface that has none "
 "of the others.",
 "Rebuild the surface from the mesh; faces are numbered by the element's own rule, and a mesh of another "
 "kind of cells has others."},
{"out-of-reach",
 "A state is given in a step in which the object doesn't count: it isn't made yet, has been taken away, or "
 "belongs to a step that this one doesn't build on.",
 "Nothing of the state reaches the deck, so a load that was to change stays as it was.",
 "See \"qrxdeck info --history\" for each step, and move the state to one that the object reaches."},
{"tie-shares-nodes",
 "Nodes lie on both sides of a tie.",
 "A tie replaces the degrees of freedom of one side by those of the other; a node that is on both would be "
 "replaced by itself. Solvers leave it out or stop because it is overconstrained.",
 "Parts that share nodes are joined already and need no tie. Else take the shared nodes, often those of an "
 "edge, out of one of the surfaces."},
{"unused",
 "Objects that nothing refers to: materials, sections, amplitudes, properties, profiles.",
 "They stand in the deck and change nothing. Yet the one that isn't used may be the one that you meant, "
 "when a load refers to an amplitude of last week.",
 "Refer to it or delete it. Spare objects of a library of materials can be listed under \"ignore\", with a "
 "reason."},
{"wrong-node-count",
 "Elements have another number of nodes than their type.",
 "A C3D10 with four nodes is a linear tetrahedron under a quadratic name. Solvers read connectivity by "
 "count: with too few, the next line is taken for the rest, and all elements behind it are wrong.",
 "Change the type (C3D4 for four nodes), or have the mesher make quadratic elements."},
{"comment-only",
 "The deck tells of the object in a comment and in nothing else. In the form that the object has, the "
 "language knows no keyword for it.",
 "The solver passes over comments: no symmetry, no load, no field is there, and the model is freer or less "
 "loaded than drawn.",
 "Take the class that the message names, such as a typed boundary condition XSYMM for a symmetry record."},
{"contact-without-property",
 "A step begins a contact without a property, or takes its property away.",
 "The property says what the surfaces do to each other: how pressure grows, whether they stick. Without "
 "one solvers stop, or take hard contact without friction.",
 "Name an interaction property in the state in which the contact begins. One without any option means hard "
 "and frictionless."},
{"empty-equation",
 "An equation has no terms. An equation says that a sum of degrees of freedom, each times a number, is "
 "zero; this is a sum of nothing.",
 "It constrains nothing, and its keyword without data stops some solvers. The motion that was to be coupled "
 "is free.",
 "Give two terms at least: set, degree of freedom, coefficient. The first is the one that the solver "
 "eliminates."},
{"idle-cyclic",
 "A tie is to join the sides of a sector, and the model isn't cyclic. Such a tie is marked with "
 "\"cyclicSymmetry\".",
 "The two sides are joined only as a sector of a ring with a number of sectors and an axis. Without that "
 "they stay free.",
 "Give the model its \"cyclicSymmetry\", with the number of sectors and the axis, or make it an ordinary "
 "tie."},
{"never-begun",
 "No step begins the interaction. An interaction lives from the step on that begins it, and a state that is "
 "given there does that.",
 "It is in the model and in no step of it: the surfaces pass through each other, the film cools nothing.",
 "Give a state in the step in which it is to begin, often \"Initial\" for contact. A step further on will "
 "do where the surfaces are to meet later."},
{"never-written",
 "No step writes the object: a load, condition, field or contact that no analysis step contains.",
 "The analysis runs without it, and its results are those of another model. Nothing else tells: the deck is "
 "right in itself, and the solver has nothing to complain of.",
 "Give it a state in an analysis step, or add the analysis step if there is none. \"qrxdeck info "
 "--history\" shows what each step writes."},
{"no-connectors",
 "A motion of connectors names no connectors. It drives or holds the relative motion of connector elements, "
 "and says of none that it is meant.",
 "The deck's lines refer to an element set under the condition's own name, which then isn't defined; the "
 "solver stops there.",
 "List in \"connectors\" the sets of connector elements that are to move. They are sets of elements, each "
 "named with its instance where it has one."},
{"no-output",
 "A request gives no output in a step. In the step that is named, the request leaves nothing in the deck.",
 "The run may take a day and end without the numbers that you wanted. A step of load cases, for instance, "
 "has no history.",
 "Ask for field output there, or put the request into a step that can give it. \"qrxdeck variables "
 "--step-type TYPE\" lists what a procedure knows."},
{"no-region",
 "The lines of an object will name no set, because it has no region. Its member \"region\" is missing or "
 "null, or the set that it named is gone.",
 "A load without a region is a data line that begins with a comma: solvers stop at it, or for some keywords "
 "take the whole model.",
 "Name a set or a surface of the kind that the object acts on. Null was perhaps a placeholder."},
{"no-section",
 "Elements have no section.",
 "A section gives elements their material and thickness, and without one they have no stiffness: solvers "
 "stop in the data check. They are often leftovers of a mesher, such as boundary cells.",
 "Add a section assignment for a set that holds them, or leave these cells out of the mesh."},
{"no-such-element-set",
 "A name that should be a set of elements is none. The condition lists it in \"connectors\", as a set of "
 "connector elements.",
 "Connector motions act on elements; a set of nodes, or a name that isn't there, leaves the line of the "
 "deck without a partner.",
 "Name a set of connector elements, with its instance where it has one. \"qrxdeck info\" counts the sets "
 "that there are; surfaces and node sets are others."},
{"no-such-variable",
 "The procedure has no output variable of the name. Which there are depends on the procedure and on the "
 "kind of output.",
 "It is left out of the deck, since solvers stop at names that they don't know in this procedure. You will "
 "look for it in the results in vain.",
 "Choose from \"qrxdeck variables --step-type TYPE\". Field and history know different ones: energies of "
 "the whole model are history."},
{"no-variables-left",
 "None of the variables of a request can be given in the step. Each of them was left out, for the reason "
 "that its own message tells.",
 "Depending on the request the deck asks for the preselected ones, for all, or for nothing: too little to "
 "use, or enough to fill a disk.",
 "Choose variables that the procedure has, or end the request in this step. \"qrxdeck variables --step-type "
 "TYPE\" lists those that it has."},
{"only-first",
 "Several entries are given where only the first counts. The others stand in the model, and in no line of "
 "the deck.",
 "The others have no effect, though they look as if they had: an output request reports on one interaction, "
 "not on all.",
 "Make an object for each, or keep the first only. Requests may be as many as you like, and cost the solver "
 "little more than their output."},
{"output-not-allowed",
 "The procedure doesn't allow output in the form that is asked for, and the deck gets the usual one.",
 "Output by time or by number of intervals has no meaning in a step without time, as a frequency "
 "extraction; there it goes by modes or increments.",
 "Ask in the form that the procedure has, if you need another number of frames than the usual."},
{"request-of-nothing",
 "A request names an object that gives nothing: it is suppressed, or of a class that has no output of this "
 "kind.",
 "The deck has the request, or not, but no results come of it. A bolt's force can be had from a bolt load "
 "alone, and contact forces only of a contact that is there.",
 "Name an object that is active in the step, or lift its suppression."},
{"variable-not-of-region",
 "A request asks for a variable that its region can't give: one of nodes on elements, or the other way "
 "round.",
 "The variable won't stand in the deck. Stresses live in elements, displacements at nodes; a set of nodes "
 "alone has no stress.",
 "Ask for it on a region of the other kind, or for the whole model. Forces at nodes, such as reactions, "
 "belong to nodes as well; contact pressure to the surfaces of contact."},
{"wrong-region",
 "A region is of another kind than the object acts on: nodes, elements, or faces.",
 "Pressure needs faces, a concentrated force nodes, a body force elements. The deck would name a set that "
 "the solver reads as another kind, or as none.",
 "Refer to a set of the kind that is named. If there is none yet, make it from the same geometry in the "
 "mesher."},
{"wrong-section",
 "Elements can't take the section that is assigned to them, such as a shell section on solids.",
 "The solver refuses the section or, worse, reads its data line as something else, a thickness as an "
 "attribute.",
 "Assign a section of the elements' own kind: solid, shell, membrane, beam, truss, cohesive or gasket. "
 "Often a set reaches further than meant."},
{"wrong-solver",
 "Contact of one solver stands in a job for the other. Which solver a job is for follows from its steps, or "
 "from \"analysisProduct\".",
 "The explicit and the implicit solver have different contact, with different parameters; neither reads the "
 "other's pairs.",
 "Take the class of interaction that belongs to the procedures of this model: pairs of the explicit solver "
 "only with explicit dynamics."},
// Runs of the program.
{"run-failed",
 "The program can't do what it was asked for: wrong words on the command line, a file that can't be "
 "written, no memory.",
 "Nothing was written, and an older file stands as it was. The exit code says which: 2 usage, 3 files and "
 "memory, 5 a failure of the program itself.",
 "Do as the message says. A code of 5 is a fault of the program and worth a report, with the model."},
{"run-warning",
 "The program did what it was asked for, and something is left to see to. It is told by the program itself, "
 "and not of the model.",
 "The result is good. What is left may matter to others: a temporary folder that couldn't be removed, "
 "comments that a formatted file lacks, a disk that didn't confirm.",
 "Do as the message says. A script may go on: such a warning doesn't change the exit code."},
