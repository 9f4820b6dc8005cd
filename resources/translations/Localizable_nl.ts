<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="nl" sourcelanguage="en">
<context>
    <name>Localizable</name>
    <message>
        <source>%@ Hex Color #</source>
        <extracomment>The button that opens the color space switcher. %@ is the currently selected color space. The button also functions as a label for the hex code that follows in a textfield.</extracomment>
        <translation>Hexkleur %@ #</translation>
    </message>
    <message>
        <source>Add selected color to favorites</source>
        <extracomment>This button adds the currently selected color to the list of favorites</extracomment>
        <translation>Geselecteerde kleur aan favorieten toevoegen</translation>
    </message>
    <message>
        <source>Blue</source>
        <extracomment>The color blue</extracomment>
        <translation>Blauw</translation>
    </message>
    <message>
        <source>Close</source>
        <extracomment>Button that closes the color picker</extracomment>
        <translation>Sluiten</translation>
    </message>
    <message>
        <source>Color Picker Type</source>
        <extracomment>Label for the segmented control that switches between grid, spectrum, sliders</extracomment>
        <translation>Type kleurkiezer</translation>
    </message>
    <message>
        <source>Color Space</source>
        <extracomment>Menu title for the color space switcher</extracomment>
        <translation>Kleurruimte</translation>
    </message>
    <message>
        <source>Color Spectrum</source>
        <extracomment>Color spectrum control</extracomment>
        <translation>Kleurenspectrum</translation>
    </message>
    <message>
        <source>Colors</source>
        <extracomment>Used as headline for the color picker</extracomment>
        <translation>Kleuren</translation>
    </message>
    <message>
        <source>Copy</source>
        <extracomment>Menu command that copies the selected color</extracomment>
        <translation>Kopiëren</translation>
    </message>
    <message>
        <source>Delete</source>
        <extracomment>Command that deletes a favorite color</extracomment>
        <translation>Verwijderen</translation>
    </message>
    <message>
        <source>Display P3</source>
        <extracomment>Name for the display P3 color space.</extracomment>
        <translation>Display P3</translation>
    </message>
    <message>
        <source>Done</source>
        <extracomment>Button that ends editing a number</extracomment>
        <translation>Gereed</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility</source>
        <extracomment>Button that launches eyedropper color picker</extracomment>
        <translation>Pipet</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility_Alternative1</source>
        <extracomment>Alternative label for eye dropper</extracomment>
        <translation>Kleurpipet</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility_Alternative2</source>
        <extracomment>Alternative label for eye dropper</extracomment>
        <translation>Kleur van het scherm kiezen</translation>
    </message>
    <message>
        <source>Favorites</source>
        <extracomment>Label for the container of the added favorite colors</extracomment>
        <translation>Favorieten</translation>
    </message>
    <message>
        <source>Green</source>
        <extracomment>The color green</extracomment>
        <translation>Groen</translation>
    </message>
    <message>
        <source>Grid</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Raster</translation>
    </message>
    <message>
        <source>Hue</source>
        <extracomment>Vertical axis of the color spectrum</extracomment>
        <translation>Tint</translation>
    </message>
    <message>
        <source>Lightness</source>
        <extracomment>Horizontal axis of the color spectrum</extracomment>
        <translation>Lichtheid</translation>
    </message>
    <message>
        <source>No color selected</source>
        <extracomment>Label when no color is selected</extracomment>
        <translation>Geen kleur geselecteerd</translation>
    </message>
    <message>
        <source>Opacity</source>
        <extracomment>Label for the opacity slider</extracomment>
        <translation>Dekking</translation>
    </message>
    <message>
        <source>Red</source>
        <extracomment>The color red</extracomment>
        <translation>Rood</translation>
    </message>
    <message>
        <source>Remove color</source>
        <extracomment>Label to clear color selection</extracomment>
        <translation>Kleur verwijderen</translation>
    </message>
    <message>
        <source>Selected Color</source>
        <extracomment>The currently selected color</extracomment>
        <translation>Geselecteerde kleur</translation>
    </message>
    <message>
        <source>Sliders</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Regelaars</translation>
    </message>
    <message>
        <source>Spectrum</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Spectrum</translation>
    </message>
    <message>
        <source>beige</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>beige</translation>
    </message>
    <message>
        <source>black</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>zwart</translation>
    </message>
    <message>
        <source>blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blauw</translation>
    </message>
    <message>
        <source>bluish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blauwgrijs</translation>
    </message>
    <message>
        <source>bluish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blauwgroen</translation>
    </message>
    <message>
        <source>bluish purple</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blauwpaars</translation>
    </message>
    <message>
        <source>bright %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>fel%@</translation>
    </message>
    <message>
        <source>brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>bruin</translation>
    </message>
    <message>
        <source>brownish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>bruingrijs</translation>
    </message>
    <message>
        <source>cyan</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>cyaan</translation>
    </message>
    <message>
        <source>dark %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>donker%@</translation>
    </message>
    <message>
        <source>gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>grijs</translation>
    </message>
    <message>
        <source>grayish blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>grijsblauw</translation>
    </message>
    <message>
        <source>grayish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>grijsgroen</translation>
    </message>
    <message>
        <source>green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>groen</translation>
    </message>
    <message>
        <source>greenish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>groengrijs</translation>
    </message>
    <message>
        <source>lavender</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>lavendel</translation>
    </message>
    <message>
        <source>light %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>licht%@</translation>
    </message>
    <message>
        <source>lime green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>limoengroen</translation>
    </message>
    <message>
        <source>magenta</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>magenta</translation>
    </message>
    <message>
        <source>maroon</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>wijnrood</translation>
    </message>
    <message>
        <source>medium %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>middel%@</translation>
    </message>
    <message>
        <source>mint green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>mintgroen</translation>
    </message>
    <message>
        <source>navy blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>marineblauw</translation>
    </message>
    <message>
        <source>olive green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>olijfgroen</translation>
    </message>
    <message>
        <source>orange</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>oranje</translation>
    </message>
    <message>
        <source>peach</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>perzik</translation>
    </message>
    <message>
        <source>pink</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>roze</translation>
    </message>
    <message>
        <source>pinkish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>rozegrijs</translation>
    </message>
    <message>
        <source>purple</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>paars</translation>
    </message>
    <message>
        <source>purplish blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>paarsblauw</translation>
    </message>
    <message>
        <source>purplish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>paarsgrijs</translation>
    </message>
    <message>
        <source>purplish pink</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>paarsroze</translation>
    </message>
    <message>
        <source>red</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>rood</translation>
    </message>
    <message>
        <source>reddish brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>roodbruin</translation>
    </message>
    <message>
        <source>sRGB</source>
        <extracomment>Name of the sRGB color space.</extracomment>
        <translation>sRGB</translation>
    </message>
    <message>
        <source>salmon</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>zalmroze</translation>
    </message>
    <message>
        <source>sky blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>hemelsblauw</translation>
    </message>
    <message>
        <source>tan</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>zandbruin</translation>
    </message>
    <message>
        <source>teal</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>petrol</translation>
    </message>
    <message>
        <source>turquoise</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>turquoise</translation>
    </message>
    <message>
        <source>very dark %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>zeer donker%@</translation>
    </message>
    <message>
        <source>very light %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>zeer licht%@</translation>
    </message>
    <message>
        <source>white</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>wit</translation>
    </message>
    <message>
        <source>yellow</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>geel</translation>
    </message>
    <message>
        <source>yellowish brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>geelbruin</translation>
    </message>
    <message>
        <source>yellowish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>geelgrijs</translation>
    </message>
    <message>
        <source>yellowish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>geelgroen</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="vanished">Annuleren</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation type="vanished">Plakken</translation>
    </message>
</context>
</TS>
