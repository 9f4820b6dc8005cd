<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="nb" sourcelanguage="en">
<context>
    <name>Localizable</name>
    <message>
        <source>%@ Hex Color #</source>
        <extracomment>The button that opens the color space switcher. %@ is the currently selected color space. The button also functions as a label for the hex code that follows in a textfield.</extracomment>
        <translation>Heksfarge %@ #</translation>
    </message>
    <message>
        <source>Add selected color to favorites</source>
        <extracomment>This button adds the currently selected color to the list of favorites</extracomment>
        <translation>Legg til valgt farge i favoritter</translation>
    </message>
    <message>
        <source>Blue</source>
        <extracomment>The color blue</extracomment>
        <translation>Blå</translation>
    </message>
    <message>
        <source>Close</source>
        <extracomment>Button that closes the color picker</extracomment>
        <translation>Lukk</translation>
    </message>
    <message>
        <source>Color Picker Type</source>
        <extracomment>Label for the segmented control that switches between grid, spectrum, sliders</extracomment>
        <translation>Type fargevelger</translation>
    </message>
    <message>
        <source>Color Space</source>
        <extracomment>Menu title for the color space switcher</extracomment>
        <translation>Fargerom</translation>
    </message>
    <message>
        <source>Color Spectrum</source>
        <extracomment>Color spectrum control</extracomment>
        <translation>Fargespekter</translation>
    </message>
    <message>
        <source>Colors</source>
        <extracomment>Used as headline for the color picker</extracomment>
        <translation>Farger</translation>
    </message>
    <message>
        <source>Copy</source>
        <extracomment>Menu command that copies the selected color</extracomment>
        <translation>Kopier</translation>
    </message>
    <message>
        <source>Delete</source>
        <extracomment>Command that deletes a favorite color</extracomment>
        <translation>Slett</translation>
    </message>
    <message>
        <source>Display P3</source>
        <extracomment>Name for the display P3 color space.</extracomment>
        <translation>Display P3</translation>
    </message>
    <message>
        <source>Done</source>
        <extracomment>Button that ends editing a number</extracomment>
        <translation>Ferdig</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility</source>
        <extracomment>Button that launches eyedropper color picker</extracomment>
        <translation>Pipette</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility_Alternative1</source>
        <extracomment>Alternative label for eye dropper</extracomment>
        <translation>Fargepipette</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility_Alternative2</source>
        <extracomment>Alternative label for eye dropper</extracomment>
        <translation>Hent farge fra skjermen</translation>
    </message>
    <message>
        <source>Favorites</source>
        <extracomment>Label for the container of the added favorite colors</extracomment>
        <translation>Favoritter</translation>
    </message>
    <message>
        <source>Green</source>
        <extracomment>The color green</extracomment>
        <translation>Grønn</translation>
    </message>
    <message>
        <source>Grid</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Rutenett</translation>
    </message>
    <message>
        <source>Hue</source>
        <extracomment>Vertical axis of the color spectrum</extracomment>
        <translation>Fargetone</translation>
    </message>
    <message>
        <source>Lightness</source>
        <extracomment>Horizontal axis of the color spectrum</extracomment>
        <translation>Lyshet</translation>
    </message>
    <message>
        <source>No color selected</source>
        <extracomment>Label when no color is selected</extracomment>
        <translation>Ingen farge valgt</translation>
    </message>
    <message>
        <source>Opacity</source>
        <extracomment>Label for the opacity slider</extracomment>
        <translation>Opasitet</translation>
    </message>
    <message>
        <source>Red</source>
        <extracomment>The color red</extracomment>
        <translation>Rød</translation>
    </message>
    <message>
        <source>Remove color</source>
        <extracomment>Label to clear color selection</extracomment>
        <translation>Fjern farge</translation>
    </message>
    <message>
        <source>Selected Color</source>
        <extracomment>The currently selected color</extracomment>
        <translation>Valgt farge</translation>
    </message>
    <message>
        <source>Sliders</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Glidere</translation>
    </message>
    <message>
        <source>Spectrum</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Spekter</translation>
    </message>
    <message>
        <source>beige</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>beige</translation>
    </message>
    <message>
        <source>black</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>svart</translation>
    </message>
    <message>
        <source>blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blå</translation>
    </message>
    <message>
        <source>bluish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blågrå</translation>
    </message>
    <message>
        <source>bluish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blågrønn</translation>
    </message>
    <message>
        <source>bluish purple</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blålilla</translation>
    </message>
    <message>
        <source>bright %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>klar%@</translation>
    </message>
    <message>
        <source>brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>brun</translation>
    </message>
    <message>
        <source>brownish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>brungrå</translation>
    </message>
    <message>
        <source>cyan</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>cyan</translation>
    </message>
    <message>
        <source>dark %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>mørke%@</translation>
    </message>
    <message>
        <source>gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>grå</translation>
    </message>
    <message>
        <source>grayish blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gråblå</translation>
    </message>
    <message>
        <source>grayish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>grågrønn</translation>
    </message>
    <message>
        <source>green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>grønn</translation>
    </message>
    <message>
        <source>greenish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>grønngrå</translation>
    </message>
    <message>
        <source>lavender</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>lavendelfarget</translation>
    </message>
    <message>
        <source>light %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>lyse%@</translation>
    </message>
    <message>
        <source>lime green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>limegrønn</translation>
    </message>
    <message>
        <source>magenta</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>magenta</translation>
    </message>
    <message>
        <source>maroon</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>rødbrun</translation>
    </message>
    <message>
        <source>medium %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>mellom%@</translation>
    </message>
    <message>
        <source>mint green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>mintgrønn</translation>
    </message>
    <message>
        <source>navy blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>marineblå</translation>
    </message>
    <message>
        <source>olive green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>olivengrønn</translation>
    </message>
    <message>
        <source>orange</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>oransje</translation>
    </message>
    <message>
        <source>peach</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>ferskenfarget</translation>
    </message>
    <message>
        <source>pink</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>rosa</translation>
    </message>
    <message>
        <source>pinkish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>rosagrå</translation>
    </message>
    <message>
        <source>purple</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>lilla</translation>
    </message>
    <message>
        <source>purplish blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>lillablå</translation>
    </message>
    <message>
        <source>purplish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>lillagrå</translation>
    </message>
    <message>
        <source>purplish pink</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>lillarosa</translation>
    </message>
    <message>
        <source>red</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>rød</translation>
    </message>
    <message>
        <source>reddish brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>rustbrun</translation>
    </message>
    <message>
        <source>sRGB</source>
        <extracomment>Name of the sRGB color space.</extracomment>
        <translation>sRGB</translation>
    </message>
    <message>
        <source>salmon</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>laksefarget</translation>
    </message>
    <message>
        <source>sky blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>himmelblå</translation>
    </message>
    <message>
        <source>tan</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>sandfarget</translation>
    </message>
    <message>
        <source>teal</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>petroleumsblå</translation>
    </message>
    <message>
        <source>turquoise</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>turkis</translation>
    </message>
    <message>
        <source>very dark %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>svært mørke%@</translation>
    </message>
    <message>
        <source>very light %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>svært lyse%@</translation>
    </message>
    <message>
        <source>white</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>hvit</translation>
    </message>
    <message>
        <source>yellow</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gul</translation>
    </message>
    <message>
        <source>yellowish brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gulbrun</translation>
    </message>
    <message>
        <source>yellowish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gulgrå</translation>
    </message>
    <message>
        <source>yellowish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gulgrønn</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="vanished">Avbryt</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation type="vanished">Lim inn</translation>
    </message>
</context>
</TS>
