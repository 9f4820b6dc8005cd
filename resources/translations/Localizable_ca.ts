<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ca" sourcelanguage="en">
<context>
    <name>Localizable</name>
    <message>
        <source>%@ Hex Color #</source>
        <extracomment>The button that opens the color space switcher. %@ is the currently selected color space. The button also functions as a label for the hex code that follows in a textfield.</extracomment>
        <translation>Color hexadecimal %@ #</translation>
    </message>
    <message>
        <source>Add selected color to favorites</source>
        <extracomment>This button adds the currently selected color to the list of favorites</extracomment>
        <translation>Afegeix el color seleccionat als preferits</translation>
    </message>
    <message>
        <source>Blue</source>
        <extracomment>The color blue</extracomment>
        <translation>Blau</translation>
    </message>
    <message>
        <source>Close</source>
        <extracomment>Button that closes the color picker</extracomment>
        <translation>Tanca</translation>
    </message>
    <message>
        <source>Color Picker Type</source>
        <extracomment>Label for the segmented control that switches between grid, spectrum, sliders</extracomment>
        <translation>Tipus de selector de color</translation>
    </message>
    <message>
        <source>Color Space</source>
        <extracomment>Menu title for the color space switcher</extracomment>
        <translation>Espai de color</translation>
    </message>
    <message>
        <source>Color Spectrum</source>
        <extracomment>Color spectrum control</extracomment>
        <translation>Espectre de colors</translation>
    </message>
    <message>
        <source>Colors</source>
        <extracomment>Used as headline for the color picker</extracomment>
        <translation>Colors</translation>
    </message>
    <message>
        <source>Copy</source>
        <extracomment>Menu command that copies the selected color</extracomment>
        <translation>Copia</translation>
    </message>
    <message>
        <source>Delete</source>
        <extracomment>Command that deletes a favorite color</extracomment>
        <translation>Suprimeix</translation>
    </message>
    <message>
        <source>Display P3</source>
        <extracomment>Name for the display P3 color space.</extracomment>
        <translation>Display P3</translation>
    </message>
    <message>
        <source>Done</source>
        <extracomment>Button that ends editing a number</extracomment>
        <translation>Fet</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility</source>
        <extracomment>Button that launches eyedropper color picker</extracomment>
        <translation>Comptagotes</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility_Alternative1</source>
        <extracomment>Alternative label for eye dropper</extracomment>
        <translation>Comptagotes de color</translation>
    </message>
    <message>
        <source>Eyedropper_Accessibility_Alternative2</source>
        <extracomment>Alternative label for eye dropper</extracomment>
        <translation>Tria un color de la pantalla</translation>
    </message>
    <message>
        <source>Favorites</source>
        <extracomment>Label for the container of the added favorite colors</extracomment>
        <translation>Preferits</translation>
    </message>
    <message>
        <source>Green</source>
        <extracomment>The color green</extracomment>
        <translation>Verd</translation>
    </message>
    <message>
        <source>Grid</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Quadrícula</translation>
    </message>
    <message>
        <source>Hue</source>
        <extracomment>Vertical axis of the color spectrum</extracomment>
        <translation>To</translation>
    </message>
    <message>
        <source>Lightness</source>
        <extracomment>Horizontal axis of the color spectrum</extracomment>
        <translation>Lluminositat</translation>
    </message>
    <message>
        <source>No color selected</source>
        <extracomment>Label when no color is selected</extracomment>
        <translation>Cap color seleccionat</translation>
    </message>
    <message>
        <source>Opacity</source>
        <extracomment>Label for the opacity slider</extracomment>
        <translation>Opacitat</translation>
    </message>
    <message>
        <source>Red</source>
        <extracomment>The color red</extracomment>
        <translation>Vermell</translation>
    </message>
    <message>
        <source>Remove color</source>
        <extracomment>Label to clear color selection</extracomment>
        <translation>Elimina el color</translation>
    </message>
    <message>
        <source>Selected Color</source>
        <extracomment>The currently selected color</extracomment>
        <translation>Color seleccionat</translation>
    </message>
    <message>
        <source>Sliders</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Lliscadors</translation>
    </message>
    <message>
        <source>Spectrum</source>
        <extracomment>Title of the tab.</extracomment>
        <translation>Espectre</translation>
    </message>
    <message>
        <source>beige</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>beix</translation>
    </message>
    <message>
        <source>black</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>negre</translation>
    </message>
    <message>
        <source>blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blau</translation>
    </message>
    <message>
        <source>bluish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gris blavós</translation>
    </message>
    <message>
        <source>bluish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verd blavós</translation>
    </message>
    <message>
        <source>bluish purple</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>lila blavós</translation>
    </message>
    <message>
        <source>bright %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ viu</translation>
    </message>
    <message>
        <source>brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>marró</translation>
    </message>
    <message>
        <source>brownish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gris marronós</translation>
    </message>
    <message>
        <source>cyan</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>cian</translation>
    </message>
    <message>
        <source>dark %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ fosc</translation>
    </message>
    <message>
        <source>gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gris</translation>
    </message>
    <message>
        <source>grayish blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blau grisós</translation>
    </message>
    <message>
        <source>grayish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verd grisós</translation>
    </message>
    <message>
        <source>green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verd</translation>
    </message>
    <message>
        <source>greenish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gris verdós</translation>
    </message>
    <message>
        <source>lavender</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>lavanda</translation>
    </message>
    <message>
        <source>light %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ clar</translation>
    </message>
    <message>
        <source>lime green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verd llimona</translation>
    </message>
    <message>
        <source>magenta</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>magenta</translation>
    </message>
    <message>
        <source>maroon</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>granat</translation>
    </message>
    <message>
        <source>medium %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ mitjà</translation>
    </message>
    <message>
        <source>mint green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verd menta</translation>
    </message>
    <message>
        <source>navy blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blau marí</translation>
    </message>
    <message>
        <source>olive green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verd oliva</translation>
    </message>
    <message>
        <source>orange</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>taronja</translation>
    </message>
    <message>
        <source>peach</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>préssec</translation>
    </message>
    <message>
        <source>pink</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>rosa</translation>
    </message>
    <message>
        <source>pinkish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gris rosat</translation>
    </message>
    <message>
        <source>purple</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>lila</translation>
    </message>
    <message>
        <source>purplish blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blau lilós</translation>
    </message>
    <message>
        <source>purplish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gris lilós</translation>
    </message>
    <message>
        <source>purplish pink</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>rosa lilós</translation>
    </message>
    <message>
        <source>red</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>vermell</translation>
    </message>
    <message>
        <source>reddish brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>marró rogenc</translation>
    </message>
    <message>
        <source>sRGB</source>
        <extracomment>Name of the sRGB color space.</extracomment>
        <translation>sRGB</translation>
    </message>
    <message>
        <source>salmon</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>salmó</translation>
    </message>
    <message>
        <source>sky blue</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blau cel</translation>
    </message>
    <message>
        <source>tan</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>torrat</translation>
    </message>
    <message>
        <source>teal</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blau verdós</translation>
    </message>
    <message>
        <source>turquoise</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>turquesa</translation>
    </message>
    <message>
        <source>very dark %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ molt fosc</translation>
    </message>
    <message>
        <source>very light %@</source>
        <extracomment>Lightness of a color; %@ is its name, such as &quot;blue&quot;. In one form that fits all the names.</extracomment>
        <translation>%@ molt clar</translation>
    </message>
    <message>
        <source>white</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>blanc</translation>
    </message>
    <message>
        <source>yellow</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>groc</translation>
    </message>
    <message>
        <source>yellowish brown</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>marró groguenc</translation>
    </message>
    <message>
        <source>yellowish gray</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>gris groguenc</translation>
    </message>
    <message>
        <source>yellowish green</source>
        <extracomment>Name of a color, spoken alone or within &quot;dark %@&quot; and the like: all names in one form that fits there.</extracomment>
        <translation>verd groguenc</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="vanished">Cancel·la</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation type="vanished">Enganxa</translation>
    </message>
</context>
</TS>
