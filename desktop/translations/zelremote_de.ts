<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE" sourcelanguage="en">
<context>
    <name>QObject</name>
    <message>
        <source>Read one sweep</source>
        <translation>Einen Sweep lesen</translation>
    </message>
    <message>
        <source>Read sweep after sweep</source>
        <translation>Sweep um Sweep lesen</translation>
    </message>
    <message>
        <source>Stop the continuous view or the recording</source>
        <translation>Dauerbetrieb oder Aufzeichnung anhalten</translation>
    </message>
    <message>
        <source>Draw a rectangle to look closer; press again for the whole span</source>
        <translation>Rechteck aufziehen, um näher heranzugehen; noch einmal drücken für den ganzen Span</translation>
    </message>
    <message>
        <source>Waterfall: a hundred sweeps in depth</source>
        <translation>Wasserfall: hundert Sweeps hintereinander</translation>
    </message>
    <message>
        <source>Colours of the levels</source>
        <translation>Farben der Pegel</translation>
    </message>
    <message>
        <source>How many of the newest sweeps the picture shows</source>
        <translation>Wie viele der neuesten Sweeps das Bild zeigt</translation>
    </message>
    <message>
        <source>Where the lowest and the highest level come from</source>
        <translation>Woher der niedrigste und der höchste Pegel kommen</translation>
    </message>
    <message>
        <source>Lowest level</source>
        <translation>Niedrigster Pegel</translation>
    </message>
    <message>
        <source>Highest level</source>
        <translation>Höchster Pegel</translation>
    </message>
    <message>
        <source>Frequency, time and level under the pointer</source>
        <translation>Frequenz, Zeit und Pegel unter dem Mauszeiger</translation>
    </message>
    <message>
        <source>Scripts of measurements</source>
        <translation>Messskripte</translation>
    </message>
    <message>
        <source>Centre frequency</source>
        <translation>Mittenfrequenz</translation>
    </message>
    <message>
        <source>Span</source>
        <translation>Span</translation>
    </message>
    <message>
        <source>Marker: position and level</source>
        <translation>Marker: Ort und Pegel</translation>
    </message>
    <message>
        <source>Delta marker or pointer: position and level</source>
        <translation>Deltamarker oder Mauszeiger: Ort und Pegel</translation>
    </message>
    <message>
        <source>Age of the trace, sweeps a second, and what sets the pace</source>
        <translation>Alter der Kurve, Sweeps je Sekunde und was das Tempo bestimmt</translation>
    </message>
    <message>
        <source>Last step of the exchange with the instrument</source>
        <translation>Letzter Schritt des Austauschs mit dem Messgerät</translation>
    </message>
    <message>
        <source>A soft key asks the instrument</source>
        <translation>Ein Softkey fragt das Messgerät ab</translation>
    </message>
    <message>
        <source>A soft key changes the instrument</source>
        <translation>Ein Softkey stellt das Messgerät ein</translation>
    </message>
    <message>
        <source>Frequency menu</source>
        <translation>Menü Frequenz</translation>
    </message>
    <message>
        <source>Span menu</source>
        <translation>Menü Span</translation>
    </message>
    <message>
        <source>Amplitude menu</source>
        <translation>Menü Amplitude</translation>
    </message>
    <message>
        <source>Bandwidth menu</source>
        <translation>Menü Bandbreite</translation>
    </message>
    <message>
        <source>Sweep menu</source>
        <translation>Menü Sweep</translation>
    </message>
    <message>
        <source>Trace menu</source>
        <translation>Menü Messkurve</translation>
    </message>
    <message>
        <source>Measurement menu</source>
        <translation>Menü Messung</translation>
    </message>
    <message>
        <source>Tracking generator menu</source>
        <translation>Menü Mitlaufgenerator</translation>
    </message>
    <message>
        <source>Marker menu</source>
        <translation>Menü Marker</translation>
    </message>
    <message>
        <source>Analyzer mode</source>
        <translation>Betriebsart Analysator</translation>
    </message>
    <message>
        <source>Tracking generator mode</source>
        <translation>Betriebsart Mitlaufgenerator</translation>
    </message>
    <message>
        <source>Power sensor mode</source>
        <translation>Betriebsart Leistungsmesskopf</translation>
    </message>
    <message>
        <source>Channel power mode</source>
        <translation>Betriebsart Kanalleistung</translation>
    </message>
    <message>
        <source>Occupied bandwidth mode</source>
        <translation>Betriebsart belegte Bandbreite</translation>
    </message>
    <message>
        <source>TDMA power mode</source>
        <translation>Betriebsart TDMA-Leistung</translation>
    </message>
    <message>
        <source>Distance to fault mode</source>
        <translation>Betriebsart Fehlerort</translation>
    </message>
    <message>
        <source>Switch the marker on or off</source>
        <translation>Marker ein- oder ausschalten</translation>
    </message>
    <message>
        <source>Switch the delta marker on or off</source>
        <translation>Deltamarker ein- oder ausschalten</translation>
    </message>
    <message>
        <source>Marker to the highest peak</source>
        <translation>Marker auf die höchste Spitze</translation>
    </message>
    <message>
        <source>Marker to the next peak</source>
        <translation>Marker auf die nächste Spitze</translation>
    </message>
    <message>
        <source>Marker to the minimum</source>
        <translation>Marker auf das Minimum</translation>
    </message>
    <message>
        <source>The marker&apos;s frequency becomes the centre</source>
        <translation>Die Frequenz des Markers wird zur Mittenfrequenz</translation>
    </message>
    <message>
        <source>The marker&apos;s level becomes the reference level</source>
        <translation>Der Pegel des Markers wird zum Referenzpegel</translation>
    </message>
    <message>
        <source>Preset the instrument</source>
        <translation>Messgerät auf Grundeinstellung setzen</translation>
    </message>
    <message>
        <source>Give the instrument&apos;s own keys back</source>
        <translation>Die Tasten am Messgerät wieder freigeben</translation>
    </message>
    <message>
        <source>Toggle remote (R) and local (L) control; the key shows the next state</source>
        <translation>Zwischen Fernbedienung (R) und Bedienung am Gerät (L) wechseln; die Taste zeigt den nächsten Zustand</translation>
    </message>
    <message>
        <source>A line of the instrument&apos;s protocol</source>
        <translation>Eine Zeile im Protokoll des Messgeräts</translation>
    </message>
    <message>
        <source>Send the line</source>
        <translation>Zeile senden</translation>
    </message>
    <message>
        <source>The instrument&apos;s answer</source>
        <translation>Antwort des Messgeräts</translation>
    </message>
    <message>
        <source>Length of the session</source>
        <translation>Dauer der Sitzung</translation>
    </message>
    <message>
        <source>Serial port: choose one or type a device name</source>
        <translation>Serielle Schnittstelle: auswählen oder Gerätenamen eintippen</translation>
    </message>
    <message>
        <source>Baud rate: the instrument&apos;s own</source>
        <translation>Baudrate: die des Messgeräts</translation>
    </message>
    <message>
        <source>Open the port and connect</source>
        <translation>Schnittstelle öffnen und verbinden</translation>
    </message>
    <message>
        <source>Identity of the instrument</source>
        <translation>Kennung des Messgeräts</translation>
    </message>
    <message>
        <source>Telephone number of the far modem</source>
        <translation>Rufnummer des fernen Modems</translation>
    </message>
    <message>
        <source>The modem&apos;s answer</source>
        <translation>Antwort des Modems</translation>
    </message>
    <message>
        <source>Lower end of the vertical axis</source>
        <translation>Unteres Ende der senkrechten Achse</translation>
    </message>
    <message>
        <source>Upper end of the vertical axis</source>
        <translation>Oberes Ende der senkrechten Achse</translation>
    </message>
    <message>
        <source>Name or address of the computer at the instrument</source>
        <translation>Name oder Adresse des Rechners am Messgerät</translation>
    </message>
    <message>
        <source>TCP port of the server</source>
        <translation>TCP-Port des Servers</translation>
    </message>
    <message>
        <source>State of the connection</source>
        <translation>Zustand der Verbindung</translation>
    </message>
    <message>
        <source>TCP port on which the server listens</source>
        <translation>TCP-Port, an dem der Server wartet</translation>
    </message>
    <message>
        <source>State of the server</source>
        <translation>Zustand des Servers</translation>
    </message>
    <message>
        <source>Progress of the recording or of the file that loads</source>
        <translation>Fortschritt der Aufzeichnung oder der Datei, die geladen wird</translation>
    </message>
    <message>
        <source>One trace back</source>
        <translation>Eine Messkurve zurück</translation>
    </message>
    <message>
        <source>Play the recording from here; the same key pauses</source>
        <translation>Aufzeichnung von hier an abspielen; dieselbe Taste hält an</translation>
    </message>
    <message>
        <source>One trace forward</source>
        <translation>Eine Messkurve vor</translation>
    </message>
    <message>
        <source>The trace on the graph</source>
        <translation>Die Messkurve im Diagramm</translation>
    </message>
    <message>
        <source>Position in the recording and time of the trace</source>
        <translation>Stelle in der Aufzeichnung und Zeit der Messkurve</translation>
    </message>
    <message>
        <source>Begin again at the end</source>
        <translation>Am Ende von vorn beginnen</translation>
    </message>
    <message>
        <source>As quick as it was recorded, by the times in the file</source>
        <translation>So schnell wie aufgezeichnet, nach den Zeiten in der Datei</translation>
    </message>
    <message>
        <source>Close the recording; its last trace stays</source>
        <translation>Aufzeichnung schließen; die letzte Messkurve bleibt stehen</translation>
    </message>
    <message>
        <source>Set the speed for loading traces.</source>
        <translation>Tempo, in dem geladene Messkurven gezeigt werden.</translation>
    </message>
    <message>
        <source>Seconds from one trace to the next</source>
        <translation>Sekunden von einer Messkurve zur nächsten</translation>
    </message>
    <message>
        <source>The sweep. With a marker on, drag it or move it with the arrow keys</source>
        <translation>Der Sweep. Ein eingeschalteter Marker lässt sich ziehen oder mit den Pfeiltasten bewegen</translation>
    </message>
    <message>
        <source>Graph</source>
        <translation>Diagramm</translation>
    </message>
    <message>
        <source>Spectrogram</source>
        <translation>Spektrogramm</translation>
    </message>
    <message>
        <source>Command</source>
        <translation>Befehl</translation>
    </message>
    <message>
        <source>Answer</source>
        <translation>Antwort</translation>
    </message>
    <message>
        <source>Last step</source>
        <translation>Letzter Schritt</translation>
    </message>
    <message>
        <source>Port</source>
        <translation>Schnittstelle</translation>
    </message>
    <message>
        <source>Baud rate</source>
        <translation>Baudrate</translation>
    </message>
    <message>
        <source>Instrument</source>
        <translation>Messgerät</translation>
    </message>
    <message>
        <source>Number</source>
        <translation>Nummer</translation>
    </message>
    <message>
        <source>Modem</source>
        <translation>Modem</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>Fortschritt</translation>
    </message>
    <message>
        <source>Position in the recording</source>
        <translation>Stelle in der Aufzeichnung</translation>
    </message>
    <message>
        <source>Speed</source>
        <translation>Tempo</translation>
    </message>
    <message>
        <source>Wait</source>
        <translation>Wartezeit</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
    <message>
        <source>Play</source>
        <translation>Abspielen</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Anhalten</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Vor</translation>
    </message>
    <message>
        <source>Repeat</source>
        <translation>Wiederholen</translation>
    </message>
    <message>
        <source>Real time</source>
        <translation>Echtzeit</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Ansicht</translation>
    </message>
    <message>
        <source>Pause Spectrogram</source>
        <translation>Spektrogramm anhalten</translation>
    </message>
    <message>
        <source>Save Spectrogram as Recording...</source>
        <translation>Spektrogramm als Aufzeichnung speichern...</translation>
    </message>
    <message>
        <source>Connection Doctor...</source>
        <translation>Verbindung prüfen...</translation>
    </message>
    <message>
        <source>Record Session...</source>
        <translation>Sitzung aufzeichnen...</translation>
    </message>
    <message>
        <source>Recent Files</source>
        <translation>Zuletzt geöffnete Dateien</translation>
    </message>
    <message>
        <source>Soft key</source>
        <translation>Softkey</translation>
    </message>
    <message>
        <source>Value: type a number with its prefix, then Enter</source>
        <translation>Wert: Zahl mit Vorsatz eintippen, dann Eingabetaste</translation>
    </message>
    <message>
        <source>Choice</source>
        <translation>Auswahl</translation>
    </message>
    <message>
        <source>Soft key %1</source>
        <translation>Softkey %1</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>Wert %1</translation>
    </message>
    <message>
        <source>Choice %1</source>
        <translation>Auswahl %1</translation>
    </message>
    <message>
        <source>Earlier sweeps; the wheel goes back, a click shows a sweep as the trace</source>
        <translation>Frühere Sweeps; das Rad geht zurück, ein Klick zeigt einen Sweep als Messkurve</translation>
    </message>
    <message>
        <source>%1 sweeps back</source>
        <translation>%1 Sweeps zurück</translation>
    </message>
    <message>
        <source>No sweeps yet</source>
        <translation>Noch keine Sweeps</translation>
    </message>
    <message>
        <source>No sweeps yet: start the continuous view
or load a recording</source>
        <translation>Noch keine Sweeps: Dauerbetrieb starten
oder eine Aufzeichnung laden</translation>
    </message>
    <message>
        <source>ZELRemote Help</source>
        <translation>ZELRemote – Hilfe</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Inhalt</translation>
    </message>
    <message>
        <source>Index</source>
        <translation>Stichwörter</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Suche</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>Seiten</translation>
    </message>
    <message>
        <source>First page</source>
        <translation>Erste Seite</translation>
    </message>
    <message>
        <source>Key, statement, control</source>
        <translation>Taste, Anweisung, Bedienelement</translation>
    </message>
    <message>
        <source>Words, then Enter</source>
        <translation>Wörter, dann Eingabetaste</translation>
    </message>
    <message>
        <source>No page holds all of these words.</source>
        <translation>Keine Seite enthält alle diese Wörter.</translation>
    </message>
    <message>
        <source>Nothing to show yet</source>
        <translation>Noch nichts zu zeigen</translation>
    </message>
    <message>
        <source>Connect...</source>
        <translation>Verbinden...</translation>
    </message>
    <message>
        <source>Try it on a simulated instrument</source>
        <translation>Simuliertes Gerät ausprobieren</translation>
    </message>
    <message>
        <source>Open a file...</source>
        <translation>Datei öffnen...</translation>
    </message>
    <message>
        <source>Connect to %1</source>
        <translation>Mit %1 verbinden</translation>
    </message>
    <message>
        <source>Copy Picture</source>
        <translation>Bild kopieren</translation>
    </message>
    <message>
        <source>Save Picture...</source>
        <translation>Bild speichern...</translation>
    </message>
    <message>
        <source>Save View...</source>
        <translation>Ansicht speichern...</translation>
    </message>
    <message>
        <source>Add Marker Here</source>
        <translation>Marker hier setzen</translation>
    </message>
    <message>
        <source>Zoom Back	Alt+Left</source>
        <translation>Zoom zurück	Alt+Links</translation>
    </message>
    <message>
        <source>Zoom Forward	Alt+Right</source>
        <translation>Zoom vor	Alt+Rechts</translation>
    </message>
    <message>
        <source>Whole View	Home</source>
        <translation>Ganze Ansicht	Pos1</translation>
    </message>
    <message>
        <source>Manual Scale...</source>
        <translation>Skala von Hand...</translation>
    </message>
    <message>
        <source>Panel</source>
        <translation>Bedienfeld</translation>
    </message>
    <message>
        <source>Full Screen</source>
        <translation>Vollbild</translation>
    </message>
    <message>
        <source>The simulated instrument runs at %1</source>
        <translation>Das simulierte Messgerät läuft an %1</translation>
    </message>
    <message>
        <source>The simulated instrument runs. Connect to it now?</source>
        <translation>Das simulierte Messgerät läuft. Jetzt verbinden?</translation>
    </message>
    <message>
        <source>Theme of the System</source>
        <translation>Farben des Systems</translation>
    </message>
    <message>
        <source>Light Theme</source>
        <translation>Helle Farben</translation>
    </message>
    <message>
        <source>Dark Theme</source>
        <translation>Dunkle Farben</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Sprache</translation>
    </message>
    <message>
        <source>Language of the System</source>
        <translation>Sprache des Systems</translation>
    </message>
    <message>
        <source>The language changes with the next start</source>
        <translation>Die Sprache wechselt mit dem nächsten Start</translation>
    </message>
    <message>
        <source>There is no trace to copy yet</source>
        <translation>Noch keine Messkurve zum Kopieren</translation>
    </message>
    <message>
        <source>A picture of the graph is in the clipboard</source>
        <translation>Ein Bild des Diagramms liegt in der Zwischenablage</translation>
    </message>
    <message>
        <source>Mode</source>
        <translation>Betriebsart</translation>
    </message>
    <message>
        <source>Marker</source>
        <translation>Marker</translation>
    </message>
    <message>
        <source>Command line</source>
        <translation>Befehlszeile</translation>
    </message>
    <message>
        <source>Stop the view to use the grey keys</source>
        <translation>Für die grauen Tasten erst anhalten</translation>
    </message>
    <message>
        <source>Speed:</source>
        <translation>Tempo:</translation>
    </message>
    <message>
        <source>%1 traces/s</source>
        <translation>%1 Kurven/s</translation>
    </message>
    <message>
        <source>all at once</source>
        <translation>ohne Pause</translation>
    </message>
    <message>
        <source>no sample</source>
        <translation>kein Messwert</translation>
    </message>
    <message>
        <source>Power</source>
        <translation>Leistung</translation>
    </message>
    <message>
        <source>Level of the trace under the pointer</source>
        <translation>Pegel der Messkurve unter dem Mauszeiger</translation>
    </message>
    <message>
        <source>Trace at the marker</source>
        <translation>Messkurve am Marker</translation>
    </message>
    <message>
        <source>Trace at the delta marker</source>
        <translation>Messkurve am Deltamarker</translation>
    </message>
    <message>
        <source>Position of the pointer</source>
        <translation>Ort des Mauszeigers</translation>
    </message>
    <message>
        <source>Pointer</source>
        <translation>Mauszeiger</translation>
    </message>
    <message>
        <source>trace %1</source>
        <translation>Kurve %1</translation>
    </message>
    <message>
        <source>Not serving</source>
        <translation>Server aus</translation>
    </message>
    <message>
        <source>Looking for the instrument</source>
        <translation>Messgerät wird gesucht</translation>
    </message>
    <message>
        <source>Waiting for a client</source>
        <translation>Wartet auf einen Client</translation>
    </message>
    <message>
        <source>A client is at work</source>
        <translation>Ein Client arbeitet</translation>
    </message>
    <message>
        <source>The TCP port is in error</source>
        <translation>Der TCP-Port ist gestört</translation>
    </message>
    <message>
        <source>Work is under way</source>
        <translation>Vorgang läuft</translation>
    </message>
    <message>
        <source>Traffic on the link</source>
        <translation>Verkehr auf der Leitung</translation>
    </message>
    <message>
        <source>Connecting...</source>
        <translation>Verbindet...</translation>
    </message>
    <message>
        <source>Not connected</source>
        <translation>Nicht verbunden</translation>
    </message>
    <message>
        <source>Connection lost:</source>
        <translation>Verbindung verloren:</translation>
    </message>
    <message>
        <source>Ends the number in %1 (%2)</source>
        <translation>Schließt die Zahl in %1 ab (%2)</translation>
    </message>
    <message>
        <source>Sends the entry (Enter)</source>
        <translation>Sendet die Eingabe (Eingabetaste)</translation>
    </message>
    <message>
        <source>Toolbar</source>
        <translation>Werkzeugleiste</translation>
    </message>
    <message>
        <source>Connect</source>
        <translation>Verbinden</translation>
    </message>
    <message>
        <source>Disconnect</source>
        <translation>Trennen</translation>
    </message>
    <message>
        <source>Single</source>
        <translation>Einmal</translation>
    </message>
    <message>
        <source>Continuous</source>
        <translation>Dauerbetrieb</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Stopp</translation>
    </message>
    <message>
        <source>Whole View</source>
        <translation>Ganze Ansicht</translation>
    </message>
    <message>
        <source>The whole range of both axes (Home)</source>
        <translation>Der ganze Bereich beider Achsen (Pos1)</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Öffnen</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Record</source>
        <translation>Aufzeichnen</translation>
    </message>
    <message>
        <source>Picture</source>
        <translation>Bild</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Kopieren</translation>
    </message>
    <message>
        <source>Copy a picture of the graph (Ctrl+C)</source>
        <translation>Bild des Diagramms kopieren (Strg+C)</translation>
    </message>
    <message>
        <source>Trace Tools</source>
        <translation>Kurvenwerkzeuge</translation>
    </message>
    <message>
        <source>Traces</source>
        <translation>Kurven</translation>
    </message>
    <message>
        <source>Peaks</source>
        <translation>Spitzen</translation>
    </message>
    <message>
        <source>Markers</source>
        <translation>Marker</translation>
    </message>
    <message>
        <source>Limits</source>
        <translation>Grenzen</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>Statistik</translation>
    </message>
    <message>
        <source>Clear Held Traces</source>
        <translation>Gehaltene Kurven löschen</translation>
    </message>
    <message>
        <source>Scale Level Axis</source>
        <translation>Pegelachse anpassen</translation>
    </message>
    <message>
        <source>&amp;Trace</source>
        <translation>Kur&amp;ve</translation>
    </message>
    <message>
        <source>Colour by level</source>
        <translation>Farbe nach Pegel</translation>
    </message>
    <message>
        <source>Put this line away</source>
        <translation>Diese Zeile schließen</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Try Again</source>
        <translation>Noch einmal</translation>
    </message>
    <message>
        <source>Connecting</source>
        <translation>Verbinden</translation>
    </message>
    <message>
        <source>Progress of the connection</source>
        <translation>Fortschritt der Verbindung</translation>
    </message>
    <message>
        <source>Simulated instrument</source>
        <translation>Simuliertes Gerät</translation>
    </message>
    <message>
        <source>%1, %2 baud</source>
        <translation>%1, %2 Baud</translation>
    </message>
    <message>
        <source>No instrument was found</source>
        <translation>Es wurde kein Gerät gefunden</translation>
    </message>
    <message>
        <source>Searching the baud rate</source>
        <translation>Die Baudrate wird gesucht</translation>
    </message>
    <message>
        <source>Connecting to %1</source>
        <translation>Verbinden mit %1</translation>
    </message>
    <message>
        <source>The baud rate is a whole number</source>
        <translation>Die Baudrate ist eine ganze Zahl</translation>
    </message>
    <message>
        <source>Boxes: instrument, not file</source>
        <translation>Felder: Gerät, nicht Datei</translation>
    </message>
    <message>
        <source>Single reads the power once, Continuous goes on</source>
        <translation>Single liest die Leistung einmal, Continuous fortlaufend</translation>
    </message>
    <message>
        <source>Lost connection</source>
        <translation>Verlorene Verbindung</translation>
    </message>
    <message>
        <source>The port is a whole number from 1 to 65535</source>
        <translation>Der Port ist eine ganze Zahl von 1 bis 65535</translation>
    </message>
    <message>
        <source>simulated instrument</source>
        <translation>simuliertes Gerät</translation>
    </message>
    <message>
        <source>Another one</source>
        <translation>Ein anderes</translation>
    </message>
    <message>
        <source>The instrument counts with the velocity factor</source>
        <translation>Das Gerät rechnet mit dem Verkürzungsfaktor</translation>
    </message>
    <message>
        <source>The cable is of</source>
        <translation>Das Kabel ist aus</translation>
    </message>
    <message>
        <source>with the velocity factor</source>
        <translation>mit dem Verkürzungsfaktor</translation>
    </message>
    <message>
        <source>Faults</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>Peak</source>
        <translation>Spitze</translation>
    </message>
    <message>
        <source>Shown</source>
        <translation>Angezeigt</translation>
    </message>
    <message>
        <source>In this cable</source>
        <translation>In diesem Kabel</translation>
    </message>
    <message>
        <source>Level</source>
        <translation>Pegel</translation>
    </message>
    <message>
        <source>A velocity factor is above 0 and 1 at most.</source>
        <translation>Ein Verkürzungsfaktor ist größer als 0 und höchstens 1.</translation>
    </message>
    <message>
        <source>There are distances when the instrument measures Distance to Fault.</source>
        <translation>Entfernungen gibt es, wenn das Gerät den Fehlerort misst (Distance to Fault).</translation>
    </message>
    <message>
        <source>Watch</source>
        <translation>Überwachen</translation>
    </message>
    <message>
        <source>Fault</source>
        <translation>Fehlerort</translation>
    </message>
    <message>
        <source>When a sweep fails the mask of the page Limits:</source>
        <translation>Wenn ein Sweep die Maske der Seite Grenzen verletzt:</translation>
    </message>
    <message>
        <source>Save it to</source>
        <translation>Speichern in</translation>
    </message>
    <message>
        <source>File of the failing sweeps</source>
        <translation>Datei der verletzenden Sweeps</translation>
    </message>
    <message>
        <source>Sweeps are added to the end of the file: a recording</source>
        <translation>Die Sweeps werden an die Datei angehängt: eine Aufzeichnung</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>Auswählen...</translation>
    </message>
    <message>
        <source> sweeps after it</source>
        <translation> Sweeps danach</translation>
    </message>
    <message>
        <source>and record</source>
        <translation>und aufzeichnen</translation>
    </message>
    <message>
        <source>Run</source>
        <translation>Starten</translation>
    </message>
    <message>
        <source>program and arguments</source>
        <translation>Programm und Argumente</translation>
    </message>
    <message>
        <source>{x}, {margin}, {time} and {file} are filled in. No shell reads the line; &quot;...&quot; keeps words together. One command runs at a time.</source>
        <translation>{x}, {margin}, {time} und {file} werden eingesetzt. Keine Shell liest die Zeile; &quot;...&quot; hält Wörter zusammen. Es läuft immer nur ein Befehl.</translation>
    </message>
    <message>
        <source>Views (*.csv);;All Files (*)</source>
        <translation>Ansichten (*.csv);;Alle Dateien (*)</translation>
    </message>
    <message>
        <source>Give the file to which failing sweeps go.</source>
        <translation>Bitte die Datei für die verletzenden Sweeps angeben.</translation>
    </message>
    <message>
        <source>The command has a quote without an end.</source>
        <translation>Im Befehl fehlt ein schließendes Anführungszeichen.</translation>
    </message>
    <message>
        <source>Give the command to run.</source>
        <translation>Bitte den Befehl angeben.</translation>
    </message>
    <message>
        <source>Watching</source>
        <translation>Überwacht</translation>
    </message>
    <message>
        <source>There is no mask yet: page Limits</source>
        <translation>Noch keine Maske: Seite Grenzen</translation>
    </message>
    <message>
        <source>refused</source>
        <translation>abgelehnt</translation>
    </message>
    <message>
        <source>refused: not understood</source>
        <translation>nicht verstanden</translation>
    </message>
    <message>
        <source>refused: not in this mode</source>
        <translation>falsche Betriebsart</translation>
    </message>
    <message>
        <source>refused: storage full</source>
        <translation>Speicher voll</translation>
    </message>
    <message>
        <source>refused: not allowed</source>
        <translation>nicht erlaubt</translation>
    </message>
    <message>
        <source>refused: out of range</source>
        <translation>außerhalb des Bereichs</translation>
    </message>
    <message>
        <source>unsure</source>
        <translation>unsicher</translation>
    </message>
    <message>
        <source>Serial port</source>
        <translation>Serielle Schnittstelle</translation>
    </message>
    <message>
        <source>The port is open</source>
        <translation>Die Schnittstelle ist offen</translation>
    </message>
    <message>
        <source>Dial</source>
        <translation>Wählen</translation>
    </message>
    <message>
        <source>Mask: a row a point, x in Hz; a level may be empty</source>
        <translation>Maske: eine Zeile je Punkt, x in Hz; ein Pegel darf fehlen</translation>
    </message>
    <message>
        <source>Mask</source>
        <translation>Maske</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Anwenden</translation>
    </message>
    <message>
        <source>Load...</source>
        <translation>Laden...</translation>
    </message>
    <message>
        <source>Load Mask</source>
        <translation>Maske laden</translation>
    </message>
    <message>
        <source>Save...</source>
        <translation>Speichern...</translation>
    </message>
    <message>
        <source>Save Mask</source>
        <translation>Maske speichern</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Entfernen</translation>
    </message>
    <message>
        <source>Antenna...</source>
        <translation>Antenne...</translation>
    </message>
    <message>
        <source>Cable...</source>
        <translation>Kabel...</translation>
    </message>
    <message>
        <source>Amplifier...</source>
        <translation>Verstärker...</translation>
    </message>
    <message>
        <source>Load Correction</source>
        <translation>Korrektur laden</translation>
    </message>
    <message>
        <source>No sweep was held against the mask yet</source>
        <translation>Noch kein Sweep wurde mit der Maske verglichen</translation>
    </message>
    <message>
        <source>No mask</source>
        <translation>Keine Maske</translation>
    </message>
    <message>
        <source>No correction: tables x;db over frequency</source>
        <translation>Keine Korrektur: Tabellen x;db über der Frequenz</translation>
    </message>
    <message>
        <source>Corrected: %1</source>
        <translation>Korrigiert: %1</translation>
    </message>
    <message>
        <source>Refusal</source>
        <translation>Ablehnung</translation>
    </message>
    <message>
        <source>Threshold</source>
        <translation>Schwelle</translation>
    </message>
    <message>
        <source>none</source>
        <translation>keine</translation>
    </message>
    <message>
        <source>Excursion</source>
        <translation>Abfall</translation>
    </message>
    <message>
        <source>Over</source>
        <translation>Über</translation>
    </message>
    <message>
        <source>Fall, dB</source>
        <translation>Abfall, dB</translation>
    </message>
    <message>
        <source>Order</source>
        <translation>Reihenfolge</translation>
    </message>
    <message>
        <source>By level</source>
        <translation>Nach Pegel</translation>
    </message>
    <message>
        <source>By x</source>
        <translation>Nach x</translation>
    </message>
    <message>
        <source>A click puts a marker on the peak</source>
        <translation>Ein Klick setzt einen Marker auf die Spitze</translation>
    </message>
    <message>
        <source>Copy Table</source>
        <translation>Tabelle kopieren</translation>
    </message>
    <message>
        <source>Save Table...</source>
        <translation>Tabelle speichern...</translation>
    </message>
    <message>
        <source>Save Peaks</source>
        <translation>Spitzen speichern</translation>
    </message>
    <message>
        <source>At</source>
        <translation>Bei</translation>
    </message>
    <message>
        <source>Delta to</source>
        <translation>Delta zu</translation>
    </message>
    <message>
        <source>Noise</source>
        <translation>Rauschen</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Aus</translation>
    </message>
    <message>
        <source>Peak %1</source>
        <translation>Spitze %1</translation>
    </message>
    <message>
        <source>Here</source>
        <translation>Hier</translation>
    </message>
    <message>
        <source>Place of %1</source>
        <translation>Ort von %1</translation>
    </message>
    <message>
        <source>Here: stays where it is, while the sweeps go on</source>
        <translation>Hier: bleibt an seinem Ort, während die Sweeps weitergehen</translation>
    </message>
    <message>
        <source>Reference of %1</source>
        <translation>Bezug von %1</translation>
    </message>
    <message>
        <source>A place can be typed into the column x; the mouse drags a marker</source>
        <translation>In die Spalte x lässt sich ein Ort eintippen; die Maus zieht einen Marker</translation>
    </message>
    <message>
        <source>This is no place: %1; 935.2M is one</source>
        <translation>Das ist kein Ort: %1; 935.2M ist einer</translation>
    </message>
    <message>
        <source>The sweep does not reach %1</source>
        <translation>Der Sweep reicht nicht bis %1</translation>
    </message>
    <message>
        <source>Bandwidth</source>
        <translation>Bandbreite</translation>
    </message>
    <message>
        <source>dB down, as 3</source>
        <translation>dB darunter, etwa 3</translation>
    </message>
    <message>
        <source>Channel</source>
        <translation>Kanal</translation>
    </message>
    <message>
        <source>start, as 935M</source>
        <translation>Anfang, etwa 935M</translation>
    </message>
    <message>
        <source>Channel stop</source>
        <translation>Ende des Kanals</translation>
    </message>
    <message>
        <source>stop, as 960M</source>
        <translation>Ende, etwa 960M</translation>
    </message>
    <message>
        <source>Occupied</source>
        <translation>Belegt</translation>
    </message>
    <message>
        <source>percent, as 99</source>
        <translation>Prozent, etwa 99</translation>
    </message>
    <message>
        <source>Adjacent</source>
        <translation>Nachbarn</translation>
    </message>
    <message>
        <source>width, as 5M</source>
        <translation>Breite, etwa 5M</translation>
    </message>
    <message>
        <source>Channel spacing</source>
        <translation>Kanalabstand</translation>
    </message>
    <message>
        <source>spacing, as 5M</source>
        <translation>Abstand, etwa 5M</translation>
    </message>
    <message>
        <source>The bandwidth stands about the strongest peak, the adjacent channels about its frequency.</source>
        <translation>Die Bandbreite liegt um die stärkste Spitze, die Nachbarkanäle um deren Frequenz.</translation>
    </message>
    <message>
        <source>Recent servers</source>
        <translation>Letzte Server</translation>
    </message>
    <message>
        <source>Address</source>
        <translation>Adresse</translation>
    </message>
    <message>
        <source>of the server&apos;s certificate; empty: by its authority</source>
        <translation>des Server-Zertifikats; leer: nach Aussteller</translation>
    </message>
    <message>
        <source>Fingerprint</source>
        <translation>Fingerabdruck</translation>
    </message>
    <message>
        <source>State</source>
        <translation>Zustand</translation>
    </message>
    <message>
        <source>Device</source>
        <translation>Gerät</translation>
    </message>
    <message>
        <source>Hide in the tray</source>
        <translation>Im Infobereich ablegen</translation>
    </message>
    <message>
        <source>Network</source>
        <translation>Netzwerk</translation>
    </message>
    <message>
        <source>This machine</source>
        <translation>Dieser Rechner</translation>
    </message>
    <message>
        <source>TCP port</source>
        <translation>TCP-Port</translation>
    </message>
    <message>
        <source>private networks</source>
        <translation>private Netze</translation>
    </message>
    <message>
        <source>Allowed networks</source>
        <translation>Erlaubte Netze</translation>
    </message>
    <message>
        <source>Connection</source>
        <translation>Verbindung</translation>
    </message>
    <message>
        <source>To the instrument</source>
        <translation>Zum Messgerät</translation>
    </message>
    <message>
        <source>To the client</source>
        <translation>Zum Client</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Replace with</source>
        <translation>Ersetzen durch</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>Weitersuchen</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>Ersetzen</translation>
    </message>
    <message>
        <source>Replace All</source>
        <translation>Alle ersetzen</translation>
    </message>
    <message>
        <source>Script Editor</source>
        <translation>Skripteditor</translation>
    </message>
    <message>
        <source>Close without saving the changes?</source>
        <translation>Schließen, ohne die Änderungen zu speichern?</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>Zählen</translation>
    </message>
    <message>
        <source>Occupancy over</source>
        <translation>Belegung über</translation>
    </message>
    <message>
        <source>Occupied at or over</source>
        <translation>Belegt ab</translation>
    </message>
    <message>
        <source>occupied, %</source>
        <translation>belegt, %</translation>
    </message>
    <message>
        <source>serial:DEVICE@BAUD or tcp:HOST:PORT; empty: all ports</source>
        <translation>serial:GERÄT@BAUD oder tcp:HOST:PORT; leer: alle Schnittstellen</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Fits the level axis to what is on the graph, until the next setting</source>
        <translation>Passt die Pegelachse an das Diagramm an, bis zur nächsten Einstellung</translation>
    </message>
    <message>
        <source>Corrected sweep</source>
        <translation>Korrigierter Sweep</translation>
    </message>
    <message>
        <source>Reference %1</source>
        <translation>Referenz %1</translation>
    </message>
    <message>
        <source>Store</source>
        <translation>Merken</translation>
    </message>
    <message>
        <source>Subtract</source>
        <translation>Abziehen</translation>
    </message>
    <message>
        <source>Shows the sweep less this reference, in dB</source>
        <translation>Zeigt den Sweep abzüglich dieser Referenz, in dB</translation>
    </message>
    <message>
        <source>Takes the first trace of a saved view or a recording</source>
        <translation>Nimmt die erste Kurve einer gespeicherten Ansicht oder Aufzeichnung</translation>
    </message>
    <message>
        <source>Load Reference</source>
        <translation>Referenz laden</translation>
    </message>
    <message>
        <source>Colour of %1</source>
        <translation>Farbe von %1</translation>
    </message>
    <message>
        <source>Chooses the colour</source>
        <translation>Wählt die Farbe</translation>
    </message>
    <message>
        <source>The reference was not taken: %1</source>
        <translation>Die Referenz wurde nicht übernommen: %1</translation>
    </message>
    <message>
        <source>the file is too long</source>
        <translation>die Datei ist zu lang</translation>
    </message>
    <message>
        <source>1 sweep</source>
        <translation>1 Sweep</translation>
    </message>
    <message>
        <source>%1 sweeps</source>
        <translation>%1 Sweeps</translation>
    </message>
    <message>
        <source>Max hold</source>
        <translation>Max. halten</translation>
    </message>
    <message>
        <source>Min hold</source>
        <translation>Min. halten</translation>
    </message>
    <message>
        <source>Average, level</source>
        <translation>Mittel, Pegel</translation>
    </message>
    <message>
        <source>Average, power</source>
        <translation>Mittel, Leistung</translation>
    </message>
    <message>
        <source>Colours</source>
        <translation>Farben</translation>
    </message>
    <message>
        <source>Depth</source>
        <translation>Tiefe</translation>
    </message>
    <message>
        <source>Levels</source>
        <translation>Pegel</translation>
    </message>
    <message>
        <source>to</source>
        <translation>bis</translation>
    </message>
    <message>
        <source>Connect to the same place again</source>
        <translation>Wieder mit demselben Ziel verbinden</translation>
    </message>
    <message>
        <source>State of the lost connection</source>
        <translation>Zustand der verlorenen Verbindung</translation>
    </message>
    <message>
        <source>Connects again as soon as the port or the server is back and the instrument answers</source>
        <translation>Verbindet wieder, sobald Anschluss oder Server zurück ist und das Gerät antwortet</translation>
    </message>
    <message>
        <source>Reconnect</source>
        <translation>Wieder verbinden</translation>
    </message>
    <message>
        <source>Reconnect by Itself</source>
        <translation>Von selbst wieder verbinden</translation>
    </message>
    <message>
        <source>The connection to %1 was lost. What is shown stays until it is back.</source>
        <translation>Die Verbindung zu %1 ist verloren. Was zu sehen ist, bleibt, bis sie wieder da ist.</translation>
    </message>
    <message>
        <source>%1 has gone. Plug it in again; what is shown stays until then.</source>
        <translation>%1 ist weg. Wieder einstecken; bis dahin bleibt, was zu sehen ist.</translation>
    </message>
    <message>
        <source>%1 has gone again. Plug it in; what is shown stays until then.</source>
        <translation>%1 ist wieder weg. Einstecken; bis dahin bleibt, was zu sehen ist.</translation>
    </message>
    <message>
        <source>%1 is back.</source>
        <translation>%1 ist wieder da.</translation>
    </message>
    <message>
        <source>%1 is back, but no instrument answers at %2 baud yet. It is asked again each 5 s.</source>
        <translation>%1 ist wieder da, aber bei %2 Baud antwortet noch kein Gerät. Es wird alle 5 s wieder gefragt.</translation>
    </message>
    <message>
        <source>No connection to %1 yet: %2 It is tried again each 5 s.</source>
        <translation>Noch keine Verbindung zu %1: %2 Es wird alle 5 s wieder versucht.</translation>
    </message>
    <message>
        <source>No instrument answers on %1 at %2 baud. Check that it is on, then try again.</source>
        <translation>An %1 antwortet bei %2 Baud kein Gerät. Prüfen, ob es eingeschaltet ist, dann noch einmal versuchen.</translation>
    </message>
    <message>
        <source>No connection to %1. %2</source>
        <translation>Keine Verbindung zu %1. %2</translation>
    </message>
    <message>
        <source>%1 The recording has ended; begin it again.</source>
        <translation>%1 Die Aufzeichnung ist zu Ende; sie ist neu zu beginnen.</translation>
    </message>
    <message>
        <source>Connected to %1 again. All settings are as before.</source>
        <translation>Wieder mit %1 verbunden. Alle Einstellungen sind wie zuvor.</translation>
    </message>
    <message>
        <source>Connected to %1 again. Changed: %2.</source>
        <translation>Wieder mit %1 verbunden. Geändert: %2.</translation>
    </message>
    <message>
        <source>Connecting to %1 again</source>
        <translation>Verbindet wieder mit %1</translation>
    </message>
    <message>
        <source>The attempt was left.</source>
        <translation>Der Versuch wurde abgebrochen.</translation>
    </message>
    <message>
        <source>The server is there, but no instrument answers.</source>
        <translation>Der Server ist da, aber kein Gerät antwortet.</translation>
    </message>
    <message>
        <source>The server did not answer within 30 seconds.</source>
        <translation>Der Server hat 30 Sekunden nicht geantwortet.</translation>
    </message>
    <message>
        <source>The server closed the connection. It may be at work for another client, or not let this computer in.</source>
        <translation>Der Server hat die Verbindung geschlossen. Vielleicht arbeitet er für einen anderen Rechner oder lässt diesen nicht zu.</translation>
    </message>
    <message>
        <source>Port open, waiting for the instrument</source>
        <translation>Anschluss offen, wartet auf das Gerät</translation>
    </message>
    <message>
        <source>Server reached, waiting for the instrument</source>
        <translation>Server erreicht, wartet auf das Gerät</translation>
    </message>
    <message>
        <source>Line up, waiting for the instrument</source>
        <translation>Leitung steht, wartet auf das Gerät</translation>
    </message>
    <message>
        <source>The instrument answers, reading its settings</source>
        <translation>Das Gerät antwortet, seine Einstellungen werden gelesen</translation>
    </message>
    <message>
        <source>Waiting for the instrument, at most %1 more</source>
        <translation>Wartet auf das Gerät, höchstens noch %1</translation>
    </message>
    <message>
        <source>Waiting for the instrument</source>
        <translation>Wartet auf das Gerät</translation>
    </message>
    <message>
        <source>Searching the instrument at %1 baud, rate %2 of %3</source>
        <translation>Sucht das Gerät bei %1 Baud, Rate %2 von %3</translation>
    </message>
    <message>
        <source>No instrument answers on %1 at %2 baud. Check that it is on and that its cable is at this port</source>
        <translation>An %1 antwortet bei %2 Baud kein Gerät. Prüfen, ob es eingeschaltet ist und sein Kabel an diesem Anschluss steckt</translation>
    </message>
    <message>
        <source>%1 at %2 baud: check that the instrument is on, that its cable is at this port, and that it is set to %3 baud</source>
        <translation>%1 bei %2 Baud: prüfen, ob das Gerät eingeschaltet ist, ob sein Kabel an diesem Anschluss steckt und ob es auf %3 Baud eingestellt ist</translation>
    </message>
    <message>
        <source>%1: check that the server runs there, that its instrument is on and connected, and that no firewall is between</source>
        <translation>%1: prüfen, ob der Server dort läuft, ob sein Gerät eingeschaltet und verbunden ist und ob keine Firewall dazwischen ist</translation>
    </message>
    <message>
        <source>%1, next in %2 s</source>
        <translation>%1, nächste in %2 s</translation>
    </message>
    <message>
        <source>%1, waits for the trigger</source>
        <translation>%1, wartet auf den Trigger</translation>
    </message>
    <message>
        <source>%1, the interval of 0 s takes no trace</source>
        <translation>%1, der Abstand von 0 s nimmt keine Kurve auf</translation>
    </message>
    <message>
        <source>%1: 1 trace, %2</source>
        <translation>%1: 1 Kurve, %2</translation>
    </message>
    <message>
        <source>%1: %2 traces, %3</source>
        <translation>%1: %2 Kurven, %3</translation>
    </message>
    <message>
        <source>%1 incomplete, %2</source>
        <translation>%1 unvollständig, %2</translation>
    </message>
    <message>
        <source>%1 failed, %2</source>
        <translation>%1 fehlgeschlagen, %2</translation>
    </message>
    <message>
        <source>%1 old   %2 sweeps/s   the sweep sets the pace</source>
        <translation>%1 alt   %2 Sweeps/s   der Sweep gibt den Takt</translation>
    </message>
    <message>
        <source>%1 old   %2 sweeps/s   the line sets the pace</source>
        <translation>%1 alt   %2 Sweeps/s   die Leitung gibt den Takt</translation>
    </message>
    <message>
        <source>%1 old</source>
        <translation>%1 alt</translation>
    </message>
    <message>
        <source>pass %1/%2</source>
        <translation>bestanden %1/%2</translation>
    </message>
    <message>
        <source>Held traces ended: frequency changed</source>
        <translation>Gehaltene Kurven beendet: Frequenz geändert</translation>
    </message>
    <message>
        <source>Held traces ended: span changed</source>
        <translation>Gehaltene Kurven beendet: Span geändert</translation>
    </message>
    <message>
        <source>Held traces ended: sweep time changed</source>
        <translation>Gehaltene Kurven beendet: Sweepzeit geändert</translation>
    </message>
    <message>
        <source>Held traces ended: unit changed</source>
        <translation>Gehaltene Kurven beendet: Einheit geändert</translation>
    </message>
    <message>
        <source>Held traces ended: mode changed</source>
        <translation>Gehaltene Kurven beendet: Betriebsart geändert</translation>
    </message>
    <message>
        <source>Held traces ended: correction changed</source>
        <translation>Gehaltene Kurven beendet: Korrektur geändert</translation>
    </message>
    <message>
        <source>%1, %2 of %3 s</source>
        <translation>%1, %2 von %3 s</translation>
    </message>
    <message>
        <source>The mask was not taken, %1</source>
        <translation>Die Maske wurde nicht übernommen, %1</translation>
    </message>
    <message>
        <source>The correction was not taken, %1</source>
        <translation>Die Korrektur wurde nicht übernommen, %1</translation>
    </message>
    <message>
        <source>Pass</source>
        <translation>Bestanden</translation>
    </message>
    <message>
        <source>FAIL</source>
        <translation>NICHT BESTANDEN</translation>
    </message>
    <message>
        <source>, margin %1 at %2</source>
        <translation>, Abstand %1 bei %2</translation>
    </message>
    <message>
        <source>, no sample covered</source>
        <translation>, kein Messpunkt erfasst</translation>
    </message>
    <message>
        <source>Connect to an instrument first</source>
        <translation>Zuerst mit einem Gerät verbinden</translation>
    </message>
    <message>
        <source>There is no trace yet</source>
        <translation>Es gibt noch keine Kurve</translation>
    </message>
    <message>
        <source>The last %1 readings</source>
        <translation>Die letzten %1 Messwerte</translation>
    </message>
    <message>
        <source>Lowest %1, highest %2</source>
        <translation>Niedrigster %1, höchster %2</translation>
    </message>
    <message>
        <source>Sweep</source>
        <translation>Sweep</translation>
    </message>
    <message>
        <source>Sweep: %1 of %2 s</source>
        <translation>Sweep: %1 von %2 s</translation>
    </message>
    <message>
        <source>No figures: %1</source>
        <translation>Keine Werte: %1</translation>
    </message>
    <message>
        <source>Reference %1 has another span or unit</source>
        <translation>Referenz %1 hat einen anderen Span oder eine andere Einheit</translation>
    </message>
    <message>
        <source>Sweep less reference %1, dB</source>
        <translation>Sweep minus Referenz %1, dB</translation>
    </message>
    <message>
        <source>Mask: %1</source>
        <translation>Maske: %1</translation>
    </message>
    <message>
        <source>pass</source>
        <translation>bestanden</translation>
    </message>
    <message>
        <source>Trace %1 of %2, %3</source>
        <translation>Kurve %1 von %2, %3</translation>
    </message>
    <message>
        <source>%1 of %2   %3</source>
        <translation>%1 von %2   %3</translation>
    </message>
    <message>
        <source>The instrument did not take this value. The next sweep asks it.</source>
        <translation>Das Gerät hat diesen Wert nicht angenommen. Der nächste Sweep fragt ihn ab.</translation>
    </message>
    <message>
        <source>Read before the axis changed. The marker&apos;s keys read it again.</source>
        <translation>Vor dem Wechsel der Achse gelesen. Die Tasten des Markers lesen neu.</translation>
    </message>
    <message>
        <source>%1 readings</source>
        <translation>%1 Messwerte</translation>
    </message>
    <message>
        <source>The instrument simulator has ended</source>
        <translation>Das simulierte Gerät wurde beendet</translation>
    </message>
    <message>
        <source>The instrument simulator cannot be started: %1</source>
        <translation>Das simulierte Gerät lässt sich nicht starten: %1</translation>
    </message>
    <message>
        <source>The instrument simulator is not installed: there is no %1</source>
        <translation>Das simulierte Gerät ist nicht installiert: %1 fehlt</translation>
    </message>
    <message>
        <source>The instrument simulator does not come up</source>
        <translation>Das simulierte Gerät kommt nicht in Gang</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not %2, such as %3</source>
        <translation>&quot;%1&quot; ist keine Angabe für %2, etwa %3</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no unit of %2, such as %3</source>
        <translation>&quot;%1&quot; ist keine Einheit für %2, etwa %3</translation>
    </message>
    <message>
        <source>a frequency</source>
        <translation>eine Frequenz</translation>
    </message>
    <message>
        <source>a time</source>
        <translation>eine Zeit</translation>
    </message>
    <message>
        <source>a level</source>
        <translation>einen Pegel</translation>
    </message>
    <message>
        <source>a difference</source>
        <translation>eine Differenz</translation>
    </message>
    <message>
        <source>a length</source>
        <translation>eine Länge</translation>
    </message>
    <message>
        <source>a height</source>
        <translation>eine Höhe</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>eine Zahl</translation>
    </message>
    <message>
        <source>Of comma and point only one can be the decimal mark</source>
        <translation>Von Komma und Punkt kann nur eines das Dezimalzeichen sein</translation>
    </message>
    <message>
        <source>%1 can be %2 or %3: write it without the comma</source>
        <translation>%1 kann %2 oder %3 sein: bitte ohne das Komma schreiben</translation>
    </message>
    <message>
        <source>A small m is a thousandth: write %1 MHz</source>
        <translation>Ein kleines m ist ein Tausendstel: bitte %1 MHz schreiben</translation>
    </message>
    <message>
        <source>It is to be more than 0</source>
        <translation>Es muss mehr als 0 sein</translation>
    </message>
    <message>
        <source>Who may connect: addresses or networks such as 192.168.1.0/24, with blanks between them. Empty: this machine and the private networks.</source>
        <translation>Wer sich verbinden darf: Adressen oder Netze wie 192.168.1.0/24, mit Leerzeichen dazwischen. Leer: dieser Rechner und die privaten Netze.</translation>
    </message>
    <message>
        <source>%1 (before: %2); %3</source>
        <translation>%1 (vorher: %2); %3</translation>
    </message>
    <message>
        <source>%1 (before: %2)</source>
        <translation>%1 (vorher: %2)</translation>
    </message>
    <message>
        <source>Search Baud Rates</source>
        <translation>Baudraten durchsuchen</translation>
    </message>
    <message>
        <source>Encrypt the connection (TLS)</source>
        <translation>Verbindung verschlüsseln (TLS)</translation>
    </message>
    <message>
        <source>Keep the client at work: refuse newcomers</source>
        <translation>Client bei der Arbeit lassen: Neue abweisen</translation>
    </message>
    <message>
        <source>Copy address</source>
        <translation>Adresse kopieren</translation>
    </message>
    <message>
        <source>Disconnect client</source>
        <translation>Client trennen</translation>
    </message>
    <message>
        <source>Check</source>
        <translation>Prüfen</translation>
    </message>
    <message>
        <source>Port</source>
        <comment>of TCP</comment>
        <translation>Port</translation>
    </message>
    <message>
        <source>Not listening</source>
        <translation>Kein Serverbetrieb</translation>
    </message>
    <message>
        <source>A client is connected</source>
        <translation>Ein Client ist verbunden</translation>
    </message>
    <message>
        <source>%1 is no number: %2</source>
        <translation>%1 ist keine Zahl: %2</translation>
    </message>
    <message>
        <source>The channel&apos;s stop lies below its start</source>
        <translation>Das Ende des Kanals liegt unter seinem Anfang</translation>
    </message>
    <message>
        <source>The bandwidth takes dB above 0</source>
        <translation>Die Bandbreite nimmt dB über 0</translation>
    </message>
    <message>
        <source>The occupied bandwidth takes percent above 0, 100 at most</source>
        <translation>Die belegte Bandbreite nimmt Prozent über 0, höchstens 100</translation>
    </message>
    <message>
        <source>%1, %2 to %3</source>
        <translation>%1, %2 bis %3</translation>
    </message>
    <message>
        <source>Channel %1</source>
        <translation>Kanal %1</translation>
    </message>
    <message>
        <source>%1: lower %2, upper %3</source>
        <translation>%1: unten %2, oben %3</translation>
    </message>
    <message>
        <source>Tables (*.csv *.txt);;All Files (*)</source>
        <translation>Tabellen (*.csv *.txt);;Alle Dateien (*)</translation>
    </message>
    <message>
        <source>The file %1 cannot be read: %2</source>
        <translation>Die Datei %1 kann nicht gelesen werden: %2</translation>
    </message>
    <message>
        <source>it is too long</source>
        <translation>sie ist zu lang</translation>
    </message>
    <message>
        <source>The file %1 cannot be written: %2</source>
        <translation>Die Datei %1 kann nicht geschrieben werden: %2</translation>
    </message>
    <message>
        <source>Run again</source>
        <translation>Noch einmal</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatisch</translation>
    </message>
    <message>
        <source>As recorded</source>
        <translation>Wie aufgezeichnet</translation>
    </message>
    <message>
        <source>25 rows</source>
        <translation>25 Zeilen</translation>
    </message>
    <message>
        <source>50 rows</source>
        <translation>50 Zeilen</translation>
    </message>
    <message>
        <source>100 rows</source>
        <translation>100 Zeilen</translation>
    </message>
    <message>
        <source>Reference level</source>
        <translation>Referenzpegel</translation>
    </message>
    <message>
        <source>By hand</source>
        <translation>Von Hand</translation>
    </message>
    <message>
        <source>Save report...</source>
        <translation>Bericht speichern...</translation>
    </message>
    <message>
        <source>Attach the last 200 lines of the session</source>
        <translation>Die letzten 200 Zeilen der Sitzung anhängen</translation>
    </message>
    <message>
        <source>Stop the playback first</source>
        <translation>Erst die Wiedergabe anhalten</translation>
    </message>
    <message>
        <source>Save Statistics</source>
        <translation>Statistik speichern</translation>
    </message>
</context>
</TS>
