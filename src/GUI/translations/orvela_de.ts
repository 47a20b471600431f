<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de" sourcelanguage="en">
<context>
    <name>CBatchMode</name>
    <message>
        <source>Batch Mode</source>
        <translation>Stapelmodus</translation>
    </message>
    <message>
        <source>Batch mode is now off.</source>
        <translation>Der Stapelmodus ist jetzt aus.</translation>
    </message>
</context>
<context>
    <name>CColorPicker</name>
    <message>
        <source>Color</source>
        <translation>Farbe</translation>
    </message>
    <message>
        <source>Red</source>
        <translation>Rot</translation>
    </message>
    <message>
        <source>Green</source>
        <translation>Grün</translation>
    </message>
    <message>
        <source>Blue</source>
        <translation>Blau</translation>
    </message>
</context>
<context>
    <name>CColorPickerPopup</name>
    <message>
        <source>Color field</source>
        <translation>Farbfeld</translation>
    </message>
</context>
<context>
    <name>CDlgAbout</name>
    <message>
        <source>Kestrand Orvela</source>
        <translation>Kestrand Orvela</translation>
    </message>
    <message>
        <source>&lt;p&gt;&lt;b&gt;Orvela&lt;/b&gt; measures a photograph and corrects it: light, contrast, levels, colour, texture and noise, by itself or by some two dozen sliders.&lt;/p&gt;&lt;p&gt;&lt;b&gt;Contributors&lt;/b&gt;&lt;br&gt;Engine, windows, manual and artwork: Kestrand&lt;br&gt;Windows and settings: the Qt toolkit&lt;br&gt;Parallel processing: oneAPI Threading Building Blocks&lt;/p&gt;&lt;p&gt;Orvela is free software under the GNU General Public License, version 3 or later. It comes without any warranty.&lt;/p&gt;</source>
        <translation>&lt;p&gt;&lt;b&gt;Orvela&lt;/b&gt; misst ein Foto aus und korrigiert es: Licht, Kontrast, Tonwerte, Farbe, Struktur und Rauschen, von selbst oder mit rund zwei Dutzend Reglern.&lt;/p&gt;&lt;p&gt;&lt;b&gt;Mitwirkende&lt;/b&gt;&lt;br&gt;Bildbearbeitung, Fenster, Handbuch und Grafik: Kestrand&lt;br&gt;Fenster und Einstellungen: Qt&lt;br&gt;Parallelverarbeitung: oneAPI Threading Building Blocks&lt;/p&gt;&lt;p&gt;Orvela ist freie Software unter der GNU General Public License, Version 3 oder später. Es wird ohne jede Gewähr überlassen.&lt;/p&gt;</translation>
    </message>
</context>
<context>
    <name>CDlgAboutImpl</name>
    <message>
        <source>Kestrand Orvela %1</source>
        <translation>Kestrand Orvela %1</translation>
    </message>
</context>
<context>
    <name>CDlgCustomPreset</name>
    <message>
        <source>Choose a preset to apply</source>
        <translation>Vorgabe zum Anwenden wählen</translation>
    </message>
    <message>
        <source>This list holds the predefined settings and those you saved.</source>
        <translation>Die mitgelieferten und Ihre gespeicherten Vorgaben.</translation>
    </message>
    <message>
        <source>Preset</source>
        <translation>Vorgabe</translation>
    </message>
    <message>
        <source>View the Orvela Manual.</source>
        <translation>Das Handbuch von Orvela öffnen.</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Hilfe</translation>
    </message>
    <message>
        <source>Validates the current settings and process the picture.</source>
        <translation>Die Einstellungen übernehmen und das Bild bearbeiten.</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Go back to the mode selection without any processement.</source>
        <translation>Zurück zur Auswahl, ohne das Bild zu ändern.</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>CDlgCustomPresetImpl</name>
    <message>
        <source>There are no custom preset to load.</source>
        <translation>Es gibt keine eigene Vorgabe zum Laden.</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Hinweis</translation>
    </message>
    <message>
        <source>You don&apos;t have any profiles yet. You can create and save profiles in the Advanced mode window.</source>
        <translation>Sie haben noch keine Vorgaben. Im Fenster „Erweitert“ können Sie Vorgaben anlegen und speichern.</translation>
    </message>
</context>
<context>
    <name>CDlgDualPreview</name>
    <message>
        <source>Orvela Preview</source>
        <translation>Orvela-Vorschau</translation>
    </message>
    <message>
        <source>This window holds a preview of your original picture and the processed picture.</source>
        <translation>Dieses Fenster zeigt eine Vorschau Ihres Originals und des bearbeiteten Bildes.</translation>
    </message>
</context>
<context>
    <name>CDlgMain</name>
    <message>
        <source>This is the Orvela&apos;s main window. Select a mode to begin the processing.</source>
        <translation>Das Hauptfenster von Orvela. Wählen Sie eine Arbeitsweise, um zu beginnen.</translation>
    </message>
    <message>
        <source>Collapse the window.</source>
        <translation>Fenster verkleinern.</translation>
    </message>
    <message>
        <source>Expand the window.</source>
        <translation>Fenster vergrößern.</translation>
    </message>
    <message>
        <source>Display the Orvela About dialog.</source>
        <translation>Über Orvela.</translation>
    </message>
    <message>
        <source>A new update is available.</source>
        <translation>Eine neue Version ist verfügbar.</translation>
    </message>
    <message>
        <source>Auto</source>
        <translation>Automatisch</translation>
    </message>
    <message>
        <source>Use this mode to fine tune each filter, and achieve more complex processement.</source>
        <translation>Jeden Filter einzeln einstellen und Filter miteinander verbinden.</translation>
    </message>
    <message>
        <source>Process a picture with previously saved settings in a snap.</source>
        <translation>Ein Bild mit einer gespeicherten Vorgabe bearbeiten.</translation>
    </message>
    <message>
        <source>Click to toggle batch mode.</source>
        <translation>Stapelmodus ein- oder ausschalten.</translation>
    </message>
    <message>
        <source>View the Orvela Manual.</source>
        <translation>Das Handbuch von Orvela öffnen.</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatik</translation>
    </message>
    <message>
        <source>Auto Contrast</source>
        <translation>Auto-Kontrast</translation>
    </message>
    <message>
        <source>Auto Levels</source>
        <translation>Auto-Tonwerte</translation>
    </message>
    <message>
        <source>Auto Color</source>
        <translation>Auto-Farbe</translation>
    </message>
    <message>
        <source>Auto Saturation</source>
        <translation>Auto-Sättigung</translation>
    </message>
    <message>
        <source>Adjustments</source>
        <translation>Korrekturen</translation>
    </message>
    <message>
        <source>Add Illumination</source>
        <translation>Mehr Licht</translation>
    </message>
    <message>
        <source>Advanced</source>
        <translation>Erweitert</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Eigene</translation>
    </message>
    <message>
        <source>All Filters</source>
        <translation>Alle Filter</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Hilfe</translation>
    </message>
    <message>
        <source>About</source>
        <translation>Über Orvela</translation>
    </message>
    <message>
        <source>Batch Mode is on</source>
        <translation>Stapel: ein</translation>
    </message>
    <message>
        <source>Batch Mode is off</source>
        <translation>Stapel: aus</translation>
    </message>
</context>
<context>
    <name>CDlgMainImpl</name>
    <message>
        <source>Orvela %1</source>
        <translation>Orvela %1</translation>
    </message>
    <message>
        <source>Batch Mode Enabled</source>
        <translation>Stapelmodus eingeschaltet</translation>
    </message>
    <message>
        <source>Batch mode is now enabled! Next time when you start Orvela, Orvela will process the image with the last operation you performed with orvela.

To disable batch mode, hold &lt;b&gt;SHIFT&lt;/b&gt; pressed when selecting Orvela from Plug-ins menu.</source>
        <translation>Der Stapelmodus ist eingeschaltet. Beim nächsten Start bearbeitet Orvela das Bild so, wie Sie zuletzt eines bearbeitet haben.

Zum Ausschalten halten Sie die &lt;b&gt;Umschalttaste&lt;/b&gt; gedrückt, während Sie Orvela im Menü der Filter wählen.</translation>
    </message>
    <message>
        <source>Update Available</source>
        <translation>Neue Version</translation>
    </message>
</context>
<context>
    <name>CDlgProgramInfos</name>
    <message>
        <source>Orvela Program Informations</source>
        <translation>Informationen zu Orvela</translation>
    </message>
    <message>
        <source>&lt;h2&gt;Orvela %1&lt;/h2&gt;&lt;p&gt;A filter by Kestrand that enhances photographs.&lt;/p&gt;&lt;p&gt;It serves hosts with the Photoshop filter interface, version 4, and stands in their menu of filters under Kestrand.&lt;/p&gt;&lt;p&gt;It takes pictures with 8 or 16 bits per channel: grey, duotone, RGB, CMYK, Lab, HSL, HSB and multichannel.&lt;/p&gt;</source>
        <translation>&lt;h2&gt;Orvela %1&lt;/h2&gt;&lt;p&gt;Ein Filter von Kestrand, der Fotos verbessert.&lt;/p&gt;&lt;p&gt;Er arbeitet in Programmen mit der Photoshop-Filterschnittstelle, Version 4, und steht in deren Filtermenü unter Kestrand.&lt;/p&gt;&lt;p&gt;Er nimmt Bilder mit 8 oder 16 Bit je Kanal: Graustufen, Duplex, RGB, CMYK, Lab, HSL, HSB und Mehrkanal.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;p&gt;Made with the Qt toolkit (LGPL, version 3) and oneAPI Threading Building Blocks (Apache License, version 2.0). Orvela itself is free software under the GNU General Public License, version 3 or later; it comes without any warranty.&lt;/p&gt;</source>
        <translation>&lt;p&gt;Erstellt mit Qt (LGPL, Version 3) und oneAPI Threading Building Blocks (Apache License, Version 2.0). Orvela selbst ist freie Software unter der GNU General Public License, Version 3 oder später; es wird ohne jede Gewähr überlassen.&lt;/p&gt;</translation>
    </message>
</context>
<context>
    <name>CDlgSettings</name>
    <message>
        <source>Auto-Refresh</source>
        <translation>Automatisch</translation>
    </message>
    <message>
        <source>Force refreshing the Previews.</source>
        <translation>Vorschau aktualisieren.</translation>
    </message>
    <message>
        <source>Stop processing the picture.</source>
        <translation>Bearbeitung anhalten.</translation>
    </message>
    <message>
        <source>Zoom out from the preview pictures.</source>
        <translation>Vorschau verkleinern.</translation>
    </message>
    <message>
        <source>Get closer to the previewed pictures.</source>
        <translation>Vorschau vergrößern.</translation>
    </message>
    <message>
        <source>Turn on all sliders.</source>
        <translation>Alle Regler einschalten.</translation>
    </message>
    <message>
        <source>Turn off all sliders.</source>
        <translation>Alle Regler ausschalten.</translation>
    </message>
    <message>
        <source>Split the Preview pictures onto 2 windows.</source>
        <translation>Vorschau auf 2 Fenster verteilen.</translation>
    </message>
    <message>
        <source>Glue the Preview windows to one single pane.</source>
        <translation>Vorschaufenster zu einem verbinden.</translation>
    </message>
    <message>
        <source>This list holds the predefined settings and those you saved.</source>
        <translation>Die mitgelieferten und Ihre gespeicherten Vorgaben.</translation>
    </message>
    <message>
        <source>Revert the settings to last time the Profile was saved.</source>
        <translation>Zur gespeicherten Vorgabe zurückkehren.</translation>
    </message>
    <message>
        <source>Save the current Profile. You will be prompted for a name.</source>
        <translation>Als Vorgabe speichern; nach dem Namen wird gefragt.</translation>
    </message>
    <message>
        <source>Delete the current values to a preset.</source>
        <translation>Diese Vorgabe löschen.</translation>
    </message>
    <message>
        <source>Validates the current settings and process the picture.</source>
        <translation>Die Einstellungen übernehmen und das Bild bearbeiten.</translation>
    </message>
    <message>
        <source>Go back to the mode selection without any processement.</source>
        <translation>Zurück zur Auswahl, ohne das Bild zu ändern.</translation>
    </message>
    <message>
        <source>View the Orvela Manual.</source>
        <translation>Das Handbuch von Orvela öffnen.</translation>
    </message>
</context>
<context>
    <name>CDlgSettingsImpl</name>
    <message>
        <source>Applying custom advanced filter:</source>
        <translation>Vorgabe wird angewendet: </translation>
    </message>
    <message>
        <source>Save Preset</source>
        <translation>Vorgabe speichern</translation>
    </message>
    <message>
        <source>Enter a name for the preset to be saved as.</source>
        <translation>Name, unter dem die Vorgabe gespeichert wird:</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>The current preset cannot be deleted, since it&apos;s one of the factory presets.</source>
        <translation>Diese Vorgabe gehört zu Orvela und kann nicht gelöscht werden.</translation>
    </message>
    <message>
        <source>Deleting Preset</source>
        <translation>Vorgabe löschen</translation>
    </message>
    <message>
        <source>Are you sure you want to delete the selected preset?</source>
        <translation>Möchten Sie die gewählte Vorgabe wirklich löschen?</translation>
    </message>
    <message>
        <source>By reverting the profile, you will
loose the changes you have made. Proceed?</source>
        <translation>Beim Zurücksetzen der Vorgabe gehen
Ihre Änderungen verloren. Fortfahren?</translation>
    </message>
    <message>
        <source>Calling applyNonIteractiveMode when mRunInNonInteractiveMode is false.</source>
        <translation>applyNonIteractiveMode wurde aufgerufen, obwohl mRunInNonInteractiveMode falsch ist.</translation>
    </message>
    <message>
        <source>Stop Processing</source>
        <translation>Bearbeitung anhalten</translation>
    </message>
    <message>
        <source>The picture could not be processed: %1</source>
        <translation>Das Bild konnte nicht bearbeitet werden: %1</translation>
    </message>
    <message>
        <source>A step of the processing failed and was left out: %1 (%2)</source>
        <translation>Ein Schritt der Bearbeitung ist fehlgeschlagen und wurde ausgelassen: %1 (%2)</translation>
    </message>
    <message>
        <source>all sliders on</source>
        <translation>alle Regler ein</translation>
    </message>
    <message>
        <source>all sliders off</source>
        <translation>alle Regler aus</translation>
    </message>
    <message>
        <source>%1 on</source>
        <translation>%1 ein</translation>
    </message>
    <message>
        <source>%1 off</source>
        <translation>%1 aus</translation>
    </message>
    <message>
        <source>Color</source>
        <translation>Farbe</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Hinweis</translation>
    </message>
    <message>
        <source>%1 was loaded without what this window has no slider for: %2</source>
        <translation>%1 wurde geladen, jedoch ohne das, wofür dieses Fenster keinen Regler hat: %2</translation>
    </message>
    <message>
        <source>preset %1</source>
        <translation>Vorgabe %1</translation>
    </message>
    <message>
        <source>reverting %1</source>
        <translation>Zurücksetzen von %1</translation>
    </message>
    <message>
        <source>This name is kept for the last operation. Choose another one.</source>
        <translation>Dieser Name ist für den letzten Vorgang reserviert. Wählen Sie einen anderen.</translation>
    </message>
    <message>
        <source>Use the picture nevertheless?</source>
        <translation>Das Bild trotzdem verwenden?</translation>
    </message>
</context>
<context>
    <name>CDlgSinglePreview</name>
    <message>
        <source>Orvela Preview</source>
        <translation>Orvela-Vorschau</translation>
    </message>
    <message>
        <source>This window holds a preview of your original picture and the processed picture.</source>
        <translation>Dieses Fenster zeigt eine Vorschau Ihres Originals und des bearbeiteten Bildes.</translation>
    </message>
</context>
<context>
    <name>COrvelaSliderBlock</name>
    <message>
        <source>Switches this setting on or off. So does a double click on its row.</source>
        <translation>Schaltet diese Einstellung ein oder aus, ebenso ein Doppelklick auf die Zeile.</translation>
    </message>
    <message>
        <source>Unamed</source>
        <translation>Ohne Namen</translation>
    </message>
    <message>
        <source>This bar allows you to change this property value with your mouse only.</source>
        <translation>Mit diesem Regler ändern Sie den Wert mit der Maus.</translation>
    </message>
</context>
<context>
    <name>COrvelaSliderBlockImpl</name>
    <message>
        <source> shall be in range: </source>
        <translation> muss im Bereich liegen: </translation>
    </message>
    <message>
        <source> to </source>
        <translation> bis </translation>
    </message>
</context>
<context>
    <name>COrvelaStatusIndicator</name>
    <message>
        <source>Progress</source>
        <translation>Fortschritt</translation>
    </message>
</context>
<context>
    <name>CPresetStore</name>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>Make sure that its folder has room and that you may write there. Your pictures are not affected.</source>
        <translation>Vergewissern Sie sich, dass in dem Ordner Platz ist und dass Sie dort schreiben dürfen. Ihre Bilder sind nicht betroffen.</translation>
    </message>
    <message>
        <source>Note:</source>
        <translation>Hinweis:</translation>
    </message>
    <message>
        <source>Unknown preset:</source>
        <translation>Unbekannte Vorgabe: </translation>
    </message>
    <message>
        <source>Unknown preset:%1</source>
        <translation>Unbekannte Vorgabe: %1</translation>
    </message>
    <message>
        <source>This preset already exists. Do you want to overwrite it?</source>
        <translation>Diese Vorgabe gibt es schon. Möchten Sie sie überschreiben?</translation>
    </message>
    <message>
        <source>A preset needs a name.</source>
        <translation>Eine Vorgabe braucht einen Namen.</translation>
    </message>
</context>
<context>
    <name>CSignaledGraphicsView</name>
    <message>
        <source>Preview</source>
        <translation>Vorschau</translation>
    </message>
</context>
<context>
    <name>CWgtPane3SlidersImpl</name>
    <message>
        <source>Note:</source>
        <translation>Hinweis:</translation>
    </message>
    <message>
        <source>invalid mode in CWgtPane3SlidersImpl::setSliders</source>
        <translation>ungültiger Modus in CWgtPane3SlidersImpl::setSliders</translation>
    </message>
    <message>
        <source>invalid mode in CWgtPane3SlidersImpl::applyGUIParams</source>
        <translation>ungültiger Modus in CWgtPane3SlidersImpl::applyGUIParams</translation>
    </message>
</context>
<context>
    <name>CWgtPaneAdvanced</name>
    <message>
        <source>Final Touch</source>
        <translation>Feinschliff</translation>
    </message>
    <message>
        <source>Show the extended settings</source>
        <translation>Weitere Einstellungen zeigen</translation>
    </message>
    <message>
        <source>Hide the extended settings</source>
        <translation>Weitere Einstellungen verbergen</translation>
    </message>
    <message>
        <source> Extended Settings</source>
        <translation> Weitere Einstellungen</translation>
    </message>
    <message>
        <source>Lighting Functions</source>
        <translation>Licht</translation>
    </message>
    <message>
        <source>Perceptual / Absolute</source>
        <translation>Angepasst / Absolut</translation>
    </message>
    <message>
        <source>Perceptual</source>
        <translation>Angepasst</translation>
    </message>
    <message>
        <source>Absolute</source>
        <translation>Absolut</translation>
    </message>
    <message>
        <source>Color Functions</source>
        <translation>Farbe</translation>
    </message>
    <message>
        <source>Color Filter</source>
        <translation>Farbfilter</translation>
    </message>
    <message>
        <source>Artifacts Reduction</source>
        <translation>Störungen</translation>
    </message>
    <message>
        <source>Texture</source>
        <translation>Struktur</translation>
    </message>
    <message>
        <source>Global</source>
        <translation>Gesamt</translation>
    </message>
</context>
<context>
    <name>CWgtPaneFinalTouch</name>
    <message>
        <source>Final Touch</source>
        <translation>Feinschliff</translation>
    </message>
    <message>
        <source>Perceptual</source>
        <translation>Angepasst</translation>
    </message>
    <message>
        <source>Levels</source>
        <translation>Tonwerte</translation>
    </message>
    <message>
        <source>Channel</source>
        <translation>Kanal</translation>
    </message>
    <message>
        <source>Red</source>
        <translation>Rot</translation>
    </message>
    <message>
        <source>Green</source>
        <translation>Grün</translation>
    </message>
    <message>
        <source>Blue</source>
        <translation>Blau</translation>
    </message>
    <message>
        <source>All channels</source>
        <translation>Alle Kanäle</translation>
    </message>
    <message>
        <source>Light and Color</source>
        <translation>Licht und Farbe</translation>
    </message>
    <message>
        <source>Color Filter</source>
        <translation>Farbfilter</translation>
    </message>
    <message>
        <source>Absolute</source>
        <translation>Absolut</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
</context>
<context>
    <name>CWgtPaneFinalTouchImpl</name>
    <message>
        <source>Automatic</source>
        <translation>Automatic</translation>
    </message>
</context>
<context>
    <name>CheckVersion</name>
    <message>
        <source>Newer version of Orvela is available. You have version %1, latest available version is: %2.</source>
        <translation>Es gibt eine neuere Version von Orvela. Sie haben Version %1, die neueste Version ist: %2.</translation>
    </message>
    <message>
        <source>An update to your version is available. You have version %1, latest available version is: %2.</source>
        <translation>Es gibt eine Aktualisierung für Ihre Version. Sie haben Version %1, die neueste Version ist: %2.</translation>
    </message>
</context>
<context>
    <name>Failure</name>
    <message>
        <source>The User Settings object was invalid.</source>
        <translation>Die Einstellungen für diesen Schritt sind ungültig.</translation>
    </message>
    <message>
        <source>The filter has an invalid Output plane.</source>
        <translation>Der Filter hat keine gültige Bildebene für das Ergebnis.</translation>
    </message>
    <message>
        <source>This version of GetRGBFromHost requires direct proxy.</source>
        <translation>Das Originalbild steht diesem Schritt nicht zur Verfügung.</translation>
    </message>
    <message>
        <source>unknown error</source>
        <translation>unbekannter Fehler</translation>
    </message>
    <message>
        <source>there is not enough memory; close other programs or take a smaller picture</source>
        <translation>der Arbeitsspeicher reicht nicht aus; schließen Sie andere Programme oder nehmen Sie ein kleineres Bild</translation>
    </message>
    <message>
        <source>The analyzer has an invalid Input plane.</source>
        <translation>Die Messung hat keine gültige Bildebene.</translation>
    </message>
    <message>
        <source>Only planes of the same size can exchange their samples.</source>
        <translation>Nur gleich große Bildebenen können ihre Werte tauschen.</translation>
    </message>
    <message>
        <source>The original picture is not at hand.</source>
        <translation>Das Originalbild ist nicht greifbar.</translation>
    </message>
</context>
<context>
    <name>KeyTips</name>
    <message>
        <source>%1 (%2)</source>
        <comment>tool tip and keys</comment>
        <translation>%1 (%2)</translation>
    </message>
</context>
<context>
    <name>ModeTable</name>
    <message>
        <source>Automatic</source>
        <translation>Automatik</translation>
    </message>
    <message>
        <source>AutomaticPro</source>
        <translation>Automatik Pro</translation>
    </message>
    <message>
        <source>Auto Contrast</source>
        <translation>Auto-Kontrast</translation>
    </message>
    <message>
        <source>Auto Levels</source>
        <translation>Auto-Tonwerte</translation>
    </message>
    <message>
        <source>Auto Color</source>
        <translation>Auto-Farbe</translation>
    </message>
    <message>
        <source>Auto Saturation</source>
        <translation>Auto-Sättigung</translation>
    </message>
    <message>
        <source>Portrait</source>
        <translation>Porträt</translation>
    </message>
    <message>
        <source>PortraitPro</source>
        <translation>Porträt Pro</translation>
    </message>
    <message>
        <source>Macro</source>
        <translation>Makro</translation>
    </message>
    <message>
        <source>MacroPro</source>
        <translation>Makro Pro</translation>
    </message>
    <message>
        <source>Landscape</source>
        <translation>Landschaft</translation>
    </message>
    <message>
        <source>LandscapePro</source>
        <translation>Landschaft Pro</translation>
    </message>
    <message>
        <source>Advanced</source>
        <translation>Erweitert</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Eigene Vorgabe</translation>
    </message>
    <message>
        <source>Batch</source>
        <translation>Stapel</translation>
    </message>
    <message>
        <source>Final Touch</source>
        <translation>Feinschliff</translation>
    </message>
    <message>
        <source>Smart Sharpness</source>
        <translation>Schärfe</translation>
    </message>
    <message>
        <source>Smart Blur</source>
        <translation>Weichzeichnen</translation>
    </message>
    <message>
        <source>Add Illumination</source>
        <translation>Mehr Licht</translation>
    </message>
    <message>
        <source>Add Digital Flash</source>
        <translation>Digitalblitz</translation>
    </message>
    <message>
        <source>Saturation</source>
        <translation>Sättigung</translation>
    </message>
    <message>
        <source>Smart Contrast</source>
        <translation>Kontrast</translation>
    </message>
    <message>
        <source>Smart Brightness</source>
        <translation>Helligkeit</translation>
    </message>
    <message>
        <source>Smart Gamma</source>
        <translation>Gamma</translation>
    </message>
    <message>
        <source>B&amp;W Spots Removal</source>
        <translation>SW-Flecken entfernen</translation>
    </message>
    <message>
        <source>Noise Reduction</source>
        <translation>Rauschen reduzieren</translation>
    </message>
    <message>
        <source>Moire Reduction</source>
        <translation>Moiré reduzieren</translation>
    </message>
    <message>
        <source>Temperature</source>
        <translation>Temperatur</translation>
    </message>
    <message>
        <source>Color Filter</source>
        <translation>Farbfilter</translation>
    </message>
    <message>
        <source>Smart Levels</source>
        <translation>Tonwerte</translation>
    </message>
    <message>
        <source>Adjustments</source>
        <translation>Korrekturen</translation>
    </message>
</context>
<context>
    <name>PipelineTable</name>
    <message>
        <source>Measuring detail</source>
        <translation>Details messen</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>Messen</translation>
    </message>
    <message>
        <source>Automatic gamma, first pass</source>
        <translation>Automatisches Gamma, erster Durchgang</translation>
    </message>
    <message>
        <source>Illumination, first pass</source>
        <translation>Beleuchtung, erster Durchgang</translation>
    </message>
    <message>
        <source>Illumination, second pass</source>
        <translation>Beleuchtung, zweiter Durchgang</translation>
    </message>
    <message>
        <source>Contrast, first pass</source>
        <translation>Kontrast, erster Durchgang</translation>
    </message>
    <message>
        <source>Brightness limit</source>
        <translation>Helligkeit begrenzen</translation>
    </message>
    <message>
        <source>Smart blur</source>
        <translation>Weichzeichnen</translation>
    </message>
    <message>
        <source>Automatic colour</source>
        <translation>Automatische Farbe</translation>
    </message>
    <message>
        <source>Clarity</source>
        <translation>Klarheit</translation>
    </message>
    <message>
        <source>Contrast, second pass</source>
        <translation>Kontrast, zweiter Durchgang</translation>
    </message>
    <message>
        <source>Saturation</source>
        <translation>Sättigung</translation>
    </message>
    <message>
        <source>Noise</source>
        <translation>Rauschen</translation>
    </message>
    <message>
        <source>Black and white spots</source>
        <translation>Schwarze und weiße Flecken</translation>
    </message>
    <message>
        <source>Gamma</source>
        <translation>Gamma</translation>
    </message>
    <message>
        <source>Contrast</source>
        <translation>Kontrast</translation>
    </message>
    <message>
        <source>Moire</source>
        <translation>Moiré</translation>
    </message>
    <message>
        <source>Temperature</source>
        <translation>Temperatur</translation>
    </message>
    <message>
        <source>Colour filter</source>
        <translation>Farbfilter</translation>
    </message>
    <message>
        <source>Dark level</source>
        <translation>Tiefen</translation>
    </message>
    <message>
        <source>Middle level</source>
        <translation>Mitteltöne</translation>
    </message>
    <message>
        <source>Light level</source>
        <translation>Lichter</translation>
    </message>
    <message>
        <source>Brightness and contrast</source>
        <translation>Helligkeit und Kontrast</translation>
    </message>
    <message>
        <source>Contrast, third pass</source>
        <translation>Kontrast, dritter Durchgang</translation>
    </message>
    <message>
        <source>Measuring levels</source>
        <translation>Tonwerte messen</translation>
    </message>
    <message>
        <source>Smart gamma</source>
        <translation>Gamma, angepasst</translation>
    </message>
    <message>
        <source>Smart dark level</source>
        <translation>Tiefen, angepasst</translation>
    </message>
    <message>
        <source>Smart middle level</source>
        <translation>Mitteltöne, angepasst</translation>
    </message>
    <message>
        <source>Smart light level</source>
        <translation>Lichter, angepasst</translation>
    </message>
    <message>
        <source>Contrast, fourth pass</source>
        <translation>Kontrast, vierter Durchgang</translation>
    </message>
    <message>
        <source>Automatic gamma, second pass</source>
        <translation>Automatisches Gamma, zweiter Durchgang</translation>
    </message>
    <message>
        <source>Copying the picture</source>
        <translation>Bild kopieren</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>Fertig</translation>
    </message>
    <message>
        <source>Failed</source>
        <translation>Fehlgeschlagen</translation>
    </message>
    <message>
        <source>Final touch</source>
        <translation>Feinschliff</translation>
    </message>
</context>
<context>
    <name>PluginMain</name>
    <message>
        <source>%1
(%2)

If the problem persists, review the plug-in&apos;s log, and contact
the Kestrand support team.</source>
        <translation>%1
(%2)

Wenn das Problem bestehen bleibt, sehen Sie im Protokoll des Plug-ins nach und wenden Sie sich
an den Support von Kestrand.</translation>
    </message>
    <message>
        <source>Error while running Kestrand Orvela</source>
        <translation>Fehler beim Ausführen von Kestrand Orvela</translation>
    </message>
    <message>
        <source>The plug-in failed to run for an unknown reason.
If the problem persists, review the plug-in&apos;s log, and contact
the Kestrand support team.</source>
        <translation>Das Plug-in konnte aus unbekanntem Grund nicht ausgeführt werden.
Wenn das Problem bestehen bleibt, sehen Sie im Protokoll des Plug-ins nach und wenden Sie sich
an den Support von Kestrand.</translation>
    </message>
    <message>
        <source>The was unable to create the About dialog.</source>
        <translation>Das Fenster mit Angaben zum Programm konnte nicht geöffnet werden.</translation>
    </message>
    <message>
        <source>The plug-in was unable to prepare it&apos;s globals.</source>
        <translation>Das Plug-in konnte seine Daten nicht vorbereiten.</translation>
    </message>
    <message>
        <source>The plug-in was unable to run it&apos;s main processing method.</source>
        <translation>Das Plug-in konnte seine Verarbeitung nicht ausführen.</translation>
    </message>
</context>
<context>
    <name>PresetDrop</name>
    <message>
        <source>%1: is not a file; drop one preset file, such as one that --save-preset wrote</source>
        <translation>%1: ist keine Datei; ziehen Sie eine Vorgabendatei hierher, etwa eine von --save-preset</translation>
    </message>
    <message>
        <source>%1: cannot be read: %2</source>
        <translation>%1: lässt sich nicht lesen: %2</translation>
    </message>
    <message>
        <source>%1: is larger than 4 MB; drop a file that --save-preset wrote</source>
        <translation>%1: ist größer als 4 MB; ziehen Sie eine Datei von --save-preset hierher</translation>
    </message>
    <message>
        <source>Only one preset file at a time can be dropped here, such as one that --save-preset wrote.</source>
        <translation>Hierher kann nur eine Vorgabendatei auf einmal gezogen werden, etwa eine von --save-preset.</translation>
    </message>
    <message>
        <source>%1: holds nothing that these sliders can show (%2); drop it on the window of Advanced</source>
        <translation>%1: enthält nichts, was diese Regler zeigen können (%2); ziehen Sie die Datei auf das Fenster „Erweitert“</translation>
    </message>
</context>
<context>
    <name>PresetFile</name>
    <message>
        <source>%1: %2 must be true or false</source>
        <translation>%1: %2 muss true oder false sein</translation>
    </message>
    <message>
        <source>%1: %2 must be a number from 0 to %3</source>
        <translation>%1: %2 muss eine Zahl von 0 bis %3 sein</translation>
    </message>
    <message>
        <source>%1: is not JSON (%2 at byte %3); name a file that --save-preset wrote</source>
        <translation>%1: ist kein JSON (%2 bei Byte %3); nehmen Sie eine Datei von --save-preset</translation>
    </message>
    <message>
        <source>%1: is not a preset (a number &quot;version&quot; and an object &quot;settings&quot; are needed); name a file that --save-preset wrote</source>
        <translation>%1: ist keine Vorgabe (nötig sind eine Zahl &quot;version&quot; und ein Objekt &quot;settings&quot;); nehmen Sie eine Datei von --save-preset</translation>
    </message>
    <message>
        <source>%1: has version %2, this program reads version %3; use the program that wrote it</source>
        <translation>%1: hat Version %2, dieses Programm liest Version %3; verwenden Sie das Programm, das die Datei geschrieben hat</translation>
    </message>
</context>
<context>
    <name>SettingsEdit</name>
    <message>
        <source>The settings could not be written to %1.</source>
        <translation>Die Einstellungen konnten nicht in %1 geschrieben werden.</translation>
    </message>
    <message>
        <source>The settings file %1 holds something else, and no copy of it could be made.</source>
        <translation>Die Einstellungsdatei %1 enthält etwas anderes, und von ihr konnte keine Kopie angelegt werden.</translation>
    </message>
</context>
<context>
    <name>SliderTable</name>
    <message>
        <source>Temperature</source>
        <translation>Temperatur</translation>
    </message>
    <message>
        <source>Makes the light warmer towards 2000 and cooler towards 10000, at the same brightness.</source>
        <translation>Macht das Licht gegen 2000 wärmer und gegen 10000 kühler, bei gleicher Helligkeit.</translation>
    </message>
    <message>
        <source>Gamma</source>
        <translation>Gamma</translation>
    </message>
    <message>
        <source>Lightens the midtones above 1 and darkens them below; 1 changes nothing.</source>
        <translation>Hellt die Mitteltöne über 1 auf und dunkelt sie darunter ab; 1 ändert nichts.</translation>
    </message>
    <message>
        <source>Noise</source>
        <translation>Rauschen</translation>
    </message>
    <message>
        <source>Smooths noise and keeps edges: least at 0.5, most at 5. In large pictures its number counts even while it is off, if Sharpness is on.</source>
        <translation>Glättet Rauschen und erhält Kanten: bei 0.5 am wenigsten, bei 5 am meisten. In großen Bildern zählt die Zahl auch bei ausgeschaltetem Regler, wenn Schärfe eingeschaltet ist.</translation>
    </message>
    <message>
        <source>AutoContrast</source>
        <translation>Auto-Kontrast</translation>
    </message>
    <message>
        <source>Stretches the tones over the whole range; only on and off count.</source>
        <translation>Spreizt die Tonwerte über den ganzen Umfang; es zählt nur ein oder aus.</translation>
    </message>
    <message>
        <source>Contrast</source>
        <translation>Kontrast</translation>
    </message>
    <message>
        <source>Sets light and dark further apart above 0 and closer together below, whatever the picture.</source>
        <translation>Rückt Hell und Dunkel über 0 weiter auseinander und darunter enger zusammen, unabhängig vom Bild.</translation>
    </message>
    <message>
        <source>Sets light and dark further apart, as far as the picture bears it: not at all at 0, most at 100.</source>
        <translation>Rückt Hell und Dunkel auseinander, soweit das Bild es verträgt: bei 0 gar nicht, bei 100 am meisten.</translation>
    </message>
    <message>
        <source>Brightness</source>
        <translation>Helligkeit</translation>
    </message>
    <message>
        <source>Makes everything lighter above 0 and darker below, whatever the picture.</source>
        <translation>Macht alles über 0 heller und darunter dunkler, unabhängig vom Bild.</translation>
    </message>
    <message>
        <source>Makes the picture lighter above 0 and darker below, as far as it bears it.</source>
        <translation>Macht das Bild über 0 heller und darunter dunkler, soweit es das verträgt.</translation>
    </message>
    <message>
        <source>Illumination</source>
        <translation>Beleuchtung</translation>
    </message>
    <message>
        <source>Adds light, least to the brightest tones: hardly any at 0, most at 10.</source>
        <translation>Gibt Licht hinzu, den hellsten Tönen am wenigsten: bei 0 kaum, bei 10 am meisten.</translation>
    </message>
    <message>
        <source>Digital Flash</source>
        <translation>Digitalblitz</translation>
    </message>
    <message>
        <source>Lights the picture as a flash would have: not at all at 0, most at 100.</source>
        <translation>Beleuchtet das Bild wie ein Blitz: bei 0 gar nicht, bei 100 am meisten.</translation>
    </message>
    <message>
        <source>Saturation</source>
        <translation>Sättigung</translation>
    </message>
    <message>
        <source>Makes colours paler below 5, grey at 0, and livelier above, most at 10.</source>
        <translation>Macht Farben unter 5 blasser, bei 0 grau, und darüber lebhafter, bei 10 am meisten.</translation>
    </message>
    <message>
        <source>B&amp;W Spots</source>
        <translation>SW-Flecken</translation>
    </message>
    <message>
        <source>Takes isolated bright spots away when on; at every number as many.</source>
        <translation>Entfernt einzelne helle Flecken, wenn eingeschaltet; bei jeder Zahl gleich viele.</translation>
    </message>
    <message>
        <source>Sharpness I</source>
        <translation>Schärfe I</translation>
    </message>
    <message>
        <source>Brings out texture: 30 lightens the picture as well, 71 brings out most and keeps its brightness. Its number counts even while only Sharpness II is on.</source>
        <translation>Hebt Strukturen hervor: 30 hellt das Bild auch auf, 71 hebt am meisten hervor und erhält die Helligkeit. Die Zahl zählt auch, wenn nur Schärfe II eingeschaltet ist.</translation>
    </message>
    <message>
        <source>Sharpness II</source>
        <translation>Schärfe II</translation>
    </message>
    <message>
        <source>Brings out texture once more: 30 lightens the picture as well, 71 brings out most and keeps its brightness. Its number counts even while only Sharpness I is on.</source>
        <translation>Hebt Strukturen noch einmal hervor: 30 hellt das Bild auch auf, 71 hebt am meisten hervor und erhält die Helligkeit. Die Zahl zählt auch, wenn nur Schärfe I eingeschaltet ist.</translation>
    </message>
    <message>
        <source>Smart Blur</source>
        <translation>Weichzeichnen</translation>
    </message>
    <message>
        <source>Smooths even areas and keeps edges: least at 0, most at 1.</source>
        <translation>Glättet ebene Flächen und erhält Kanten: bei 0 am wenigsten, bei 1 am meisten.</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Tiefen</translation>
    </message>
    <message>
        <source>Darkens the midtones, and less the shadows and the lightest tones, as far as the picture bears it: not at all at 0, most at 255.</source>
        <translation>Dunkelt die Mitteltöne ab, weniger die Tiefen und die hellsten Töne, soweit das Bild es verträgt: bei 0 gar nicht, bei 255 am meisten.</translation>
    </message>
    <message>
        <source>Middle</source>
        <translation>Mitteltöne</translation>
    </message>
    <message>
        <source>Lightens the midtones above 1 and darkens them below, as far as the picture bears it.</source>
        <translation>Hellt die Mitteltöne über 1 auf und dunkelt sie darunter ab, soweit das Bild es verträgt.</translation>
    </message>
    <message>
        <source>Highlights</source>
        <translation>Lichter</translation>
    </message>
    <message>
        <source>Brightens the highlights, as far as the picture bears it: not at all at 255, most at 0.</source>
        <translation>Hellt die Lichter auf, soweit das Bild es verträgt: bei 255 gar nicht, bei 0 am meisten.</translation>
    </message>
    <message>
        <source>Darkens the midtones, and less the shadows and the lightest tones, whatever the picture: not at all at 0, most at 255.</source>
        <translation>Dunkelt die Mitteltöne ab, weniger die Tiefen und die hellsten Töne, unabhängig vom Bild: bei 0 gar nicht, bei 255 am meisten.</translation>
    </message>
    <message>
        <source>Above 1 multiplies all tones, whatever the picture, until light ones are white; below 1 changes hardly anything.</source>
        <translation>Multipliziert über 1 alle Töne, unabhängig vom Bild, bis helle weiß sind; unter 1 ändert sich kaum etwas.</translation>
    </message>
    <message>
        <source>Brightens the highlights, whatever the picture: least just below 255, most at 0, and 255 itself does as 0.</source>
        <translation>Hellt die Lichter auf, unabhängig vom Bild: kurz unter 255 am wenigsten, bei 0 am meisten, und 255 selbst wirkt wie 0.</translation>
    </message>
    <message>
        <source>Lightens the whole picture above 1 and darkens it below, as far as it bears it.</source>
        <translation>Hellt das ganze Bild über 1 auf und dunkelt es darunter ab, soweit es das verträgt.</translation>
    </message>
    <message>
        <source>Moire</source>
        <translation>Moiré</translation>
    </message>
    <message>
        <source>Puts the original back where processing made false patterns: in fewest places at 0.1, in most at 10.</source>
        <translation>Stellt das Original wieder her, wo durch die Bearbeitung falsche Muster entstanden: bei 0.1 an den wenigsten Stellen, bei 10 an den meisten.</translation>
    </message>
    <message>
        <source>AutoColor</source>
        <translation>Auto-Farbe</translation>
    </message>
    <message>
        <source>Removes colour casts by stretching each colour, from 56 on; up to 55 it leaves colours alone.</source>
        <translation>Entfernt Farbstiche, indem jede Farbe gespreizt wird, ab 56; bis 55 bleiben die Farben, wie sie sind.</translation>
    </message>
    <message>
        <source>Fade</source>
        <translation>Abschwächen</translation>
    </message>
    <message>
        <source>Color Filter</source>
        <translation>Farbfilter</translation>
    </message>
    <message>
        <source>Tints the picture with the picked colour: not at all at 0, completely at 100.</source>
        <translation>Färbt das Bild mit der gewählten Farbe ein: bei 0 gar nicht, bei 100 vollständig.</translation>
    </message>
    <message>
        <source>Shadows</source>
        <translation>Tiefen</translation>
    </message>
    <message>
        <source>Darkens the midtones of red, and less its shadows and lightest tones, as far as the picture bears it: not at all at 0, most at 255.</source>
        <translation>Dunkelt die Mitteltöne im Rotkanal ab, weniger dessen Tiefen und hellste Töne, soweit das Bild es verträgt: bei 0 gar nicht, bei 255 am meisten.</translation>
    </message>
    <message>
        <source>Darkens the midtones of green, and less its shadows and lightest tones, as far as the picture bears it: not at all at 0, most at 255.</source>
        <translation>Dunkelt die Mitteltöne im Grünkanal ab, weniger dessen Tiefen und hellste Töne, soweit das Bild es verträgt: bei 0 gar nicht, bei 255 am meisten.</translation>
    </message>
    <message>
        <source>Darkens the midtones of blue, and less its shadows and lightest tones, as far as the picture bears it: not at all at 0, most at 255.</source>
        <translation>Dunkelt die Mitteltöne im Blaukanal ab, weniger dessen Tiefen und hellste Töne, soweit das Bild es verträgt: bei 0 gar nicht, bei 255 am meisten.</translation>
    </message>
    <message>
        <source>Darkens the midtones of all colours, and less their shadows and lightest tones, as far as the picture bears it: not at all at 0, most at 255.</source>
        <translation>Dunkelt die Mitteltöne aller Kanäle ab, weniger deren Tiefen und hellste Töne, soweit das Bild es verträgt: bei 0 gar nicht, bei 255 am meisten.</translation>
    </message>
    <message>
        <source>Lightens the midtones of red above 1 and darkens them below, as far as the picture bears it.</source>
        <translation>Hellt die Mitteltöne im Rotkanal über 1 auf und dunkelt sie darunter ab, soweit das Bild es verträgt.</translation>
    </message>
    <message>
        <source>Lightens the midtones of green above 1 and darkens them below, as far as the picture bears it.</source>
        <translation>Hellt die Mitteltöne im Grünkanal über 1 auf und dunkelt sie darunter ab, soweit das Bild es verträgt.</translation>
    </message>
    <message>
        <source>Lightens the midtones of blue above 1 and darkens them below, as far as the picture bears it.</source>
        <translation>Hellt die Mitteltöne im Blaukanal über 1 auf und dunkelt sie darunter ab, soweit das Bild es verträgt.</translation>
    </message>
    <message>
        <source>Lightens the midtones of all colours above 1 and darkens them below, as far as the picture bears it.</source>
        <translation>Hellt die Mitteltöne aller Kanäle über 1 auf und dunkelt sie darunter ab, soweit das Bild es verträgt.</translation>
    </message>
    <message>
        <source>Brightens the highlights of red, as far as the picture bears it: not at all at 255, most at 0.</source>
        <translation>Hellt die Lichter im Rotkanal auf, soweit das Bild es verträgt: bei 255 gar nicht, bei 0 am meisten.</translation>
    </message>
    <message>
        <source>Brightens the highlights of green, as far as the picture bears it: not at all at 255, most at 0.</source>
        <translation>Hellt die Lichter im Grünkanal auf, soweit das Bild es verträgt: bei 255 gar nicht, bei 0 am meisten.</translation>
    </message>
    <message>
        <source>Brightens the highlights of blue, as far as the picture bears it: not at all at 255, most at 0.</source>
        <translation>Hellt die Lichter im Blaukanal auf, soweit das Bild es verträgt: bei 255 gar nicht, bei 0 am meisten.</translation>
    </message>
    <message>
        <source>Brightens the highlights of all colours, as far as the picture bears it: not at all at 255, most at 0.</source>
        <translation>Hellt die Lichter aller Kanäle auf, soweit das Bild es verträgt: bei 255 gar nicht, bei 0 am meisten.</translation>
    </message>
    <message>
        <source>Darkens the midtones of red, and less its shadows and lightest tones, whatever the picture: not at all at 0, most at 255.</source>
        <translation>Dunkelt die Mitteltöne im Rotkanal ab, weniger dessen Tiefen und hellste Töne, unabhängig vom Bild: bei 0 gar nicht, bei 255 am meisten.</translation>
    </message>
    <message>
        <source>Darkens the midtones of green, and less its shadows and lightest tones, whatever the picture: not at all at 0, most at 255.</source>
        <translation>Dunkelt die Mitteltöne im Grünkanal ab, weniger dessen Tiefen und hellste Töne, unabhängig vom Bild: bei 0 gar nicht, bei 255 am meisten.</translation>
    </message>
    <message>
        <source>Darkens the midtones of blue, and less its shadows and lightest tones, whatever the picture: not at all at 0, most at 255.</source>
        <translation>Dunkelt die Mitteltöne im Blaukanal ab, weniger dessen Tiefen und hellste Töne, unabhängig vom Bild: bei 0 gar nicht, bei 255 am meisten.</translation>
    </message>
    <message>
        <source>Darkens the midtones of all colours, and less their shadows and lightest tones, whatever the picture: not at all at 0, most at 255.</source>
        <translation>Dunkelt die Mitteltöne aller Kanäle ab, weniger deren Tiefen und hellste Töne, unabhängig vom Bild: bei 0 gar nicht, bei 255 am meisten.</translation>
    </message>
    <message>
        <source>Brightens the highlights of red, whatever the picture: not at all at 255, most at 0.</source>
        <translation>Hellt die Lichter im Rotkanal auf, unabhängig vom Bild: bei 255 gar nicht, bei 0 am meisten.</translation>
    </message>
    <message>
        <source>Brightens the highlights of green, whatever the picture: not at all at 255, most at 0.</source>
        <translation>Hellt die Lichter im Grünkanal auf, unabhängig vom Bild: bei 255 gar nicht, bei 0 am meisten.</translation>
    </message>
    <message>
        <source>Brightens the highlights of blue, whatever the picture: not at all at 255, most at 0.</source>
        <translation>Hellt die Lichter im Blaukanal auf, unabhängig vom Bild: bei 255 gar nicht, bei 0 am meisten.</translation>
    </message>
    <message>
        <source>Brightens the highlights of all colours, whatever the picture: not at all at 255, most at 0.</source>
        <translation>Hellt die Lichter aller Kanäle auf, unabhängig vom Bild: bei 255 gar nicht, bei 0 am meisten.</translation>
    </message>
    <message>
        <source>The colour with which Color Filter tints the picture.</source>
        <translation>Die Farbe, mit der der Farbfilter das Bild einfärbt.</translation>
    </message>
    <message>
        <source>The colour with which Color Filter tints the finished picture.</source>
        <translation>Die Farbe, mit der der Farbfilter das fertige Bild einfärbt.</translation>
    </message>
    <message>
        <source>Brings the original back where sharpness or digital flash is on: none of it at 0, most at 100. Its number counts even while it is off.</source>
        <translation>Holt das Original zurück, wo Schärfe oder Digitalblitz an ist: bei 0 gar nicht, bei 100 am meisten. Die Zahl zählt auch, während er aus ist.</translation>
    </message>
    <message>
        <source>Multiplies the tones of red: lighter above 1, darker below, white included.</source>
        <translation>Multipliziert die Töne im Rotkanal: heller über 1, dunkler darunter, auch Weiß.</translation>
    </message>
    <message>
        <source>Multiplies the tones of green: lighter above 1, darker below, white included.</source>
        <translation>Multipliziert die Töne im Grünkanal: heller über 1, dunkler darunter, auch Weiß.</translation>
    </message>
    <message>
        <source>Multiplies the tones of blue: lighter above 1, darker below, white included.</source>
        <translation>Multipliziert die Töne im Blaukanal: heller über 1, dunkler darunter, auch Weiß.</translation>
    </message>
    <message>
        <source>Multiplies the tones of all colours: lighter above 1, darker below, white included.</source>
        <translation>Multipliziert die Töne aller Kanäle: heller über 1, dunkler darunter, auch Weiß.</translation>
    </message>
</context>
<context>
    <name>ZoomTable</name>
    <message>
        <source>%1%</source>
        <comment>percentage</comment>
        <translation>%1&#xa0;%</translation>
    </message>
</context>
<context>
    <name>orvela::HelpWindow</name>
    <message>
        <source>Orvela Manual</source>
        <translation>Handbuch von Orvela</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Vor</translation>
    </message>
    <message>
        <source>First page</source>
        <translation>Erste Seite</translation>
    </message>
    <message>
        <source>Find on this page</source>
        <translation>Auf dieser Seite suchen</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Inhalt</translation>
    </message>
    <message>
        <source>Not on this page</source>
        <translation>Nicht auf dieser Seite</translation>
    </message>
    <message>
        <source>Find on this page; the next place: %1 or %2, the one before: %3</source>
        <translation>Auf dieser Seite suchen; nächste Stelle: %1 oder %2, vorige: %3</translation>
    </message>
</context>
<context>
    <name>orvela::HistogramView</name>
    <message>
        <source>Histogram</source>
        <translation>Histogramm</translation>
    </message>
    <message>
        <source>How often each brightness and colour occurs, from black to white. The line is the original picture.</source>
        <translation>Wie oft jede Helligkeit und Farbe vorkommt, von Schwarz bis Weiß. Die Linie ist das Original.</translation>
    </message>
</context>
<context>
    <name>orvela::PaneHistory</name>
    <message>
        <source>%1: %2</source>
        <comment>undo or redo: what</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Rückgängig</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Wiederholen</translation>
    </message>
</context>
<context>
    <name>orvela::PreviewBar</name>
    <message>
        <source>Fit</source>
        <translation>Einpassen</translation>
    </message>
    <message>
        <source>1:1</source>
        <translation>1:1</translation>
    </message>
    <message>
        <source>Compare</source>
        <translation>Vergleichen</translation>
    </message>
    <message>
        <source>Draft</source>
        <translation>Entwurf</translation>
    </message>
    <message>
        <source>A quick look while a slider moves. The exact picture follows.</source>
        <translation>Ein schneller Blick, während ein Regler bewegt wird. Das genaue Bild folgt.</translation>
    </message>
    <message>
        <source>Show the whole width of the picture.</source>
        <translation>Die ganze Breite des Bildes zeigen.</translation>
    </message>
    <message>
        <source>Show every pixel of the picture as one of the screen.</source>
        <translation>Jedes Pixel des Bildes als ein Pixel des Bildschirms zeigen.</translation>
    </message>
    <message>
        <source>Draw a line across the processed picture, left of which the original is seen; %1 and %2 move it. Hold the space bar over the pictures, or %3, to see the whole original.</source>
        <translation>Das bearbeitete Bild durch eine Linie teilen, links von der das Original zu sehen ist; %1 und %2 verschieben sie. Halten Sie über den Bildern die Leertaste oder %3 gedrückt, um das ganze Original zu sehen.</translation>
    </message>
</context>
<context>
    <name>orvela::Previews</name>
    <message>
        <source>Original picture</source>
        <translation>Originalbild</translation>
    </message>
    <message>
        <source>Processed picture</source>
        <translation>Bearbeitetes Bild</translation>
    </message>
    <message>
        <source>Original and Processed Pictures (Preview)</source>
        <translation>Original und bearbeitetes Bild (Vorschau)</translation>
    </message>
    <message>
        <source>Original Picture (Preview)</source>
        <translation>Original (Vorschau)</translation>
    </message>
    <message>
        <source>Processed Picture (Preview)</source>
        <translation>Bearbeitetes Bild (Vorschau)</translation>
    </message>
    <message>
        <source>1:1</source>
        <translation>1:1</translation>
    </message>
</context>
<context>
    <name>orvela::UpdateMessage</name>
    <message>
        <source>Do not show this message again</source>
        <translation>Diese Nachricht nicht mehr zeigen</translation>
    </message>
    <message>
        <source>Ok</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>Mitteilung</translation>
    </message>
</context>
</TS>
