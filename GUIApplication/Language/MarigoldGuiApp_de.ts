<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE">
<context>
    <name>CalibrationNeededPopup</name>
    <message>
        <source>Calibration Required</source>
        <translation>Kalibrierung erforderlich</translation>
    </message>
    <message>
        <source>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</source>
        <translation>Neue Messungen sind erst nach der Kalibrierung des Geräts möglich. Drücken Sie „Kalibrieren“, um die Kalibrierung zu starten.</translation>
    </message>
    <message>
        <source>Ignore</source>
        <translation>Ignorieren</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Kalibrieren</translation>
    </message>
    <message>
        <source>Calibration needed within %1 %2</source>
        <translation>Kalibrierung fällig in %1 %2</translation>
    </message>
    <message>
        <source>seconds</source>
        <translation>Sekunden</translation>
    </message>
    <message>
        <source>minutes</source>
        <translation>Minuten</translation>
    </message>
    <message>
        <source>hours</source>
        <translation>Stunden</translation>
    </message>
    <message>
        <source>days</source>
        <translation>Tagen</translation>
    </message>
</context>
<context>
    <name>CalibrationPopup</name>
    <message>
        <source>Calibration Starting</source>
        <translation>Kalibrierung beginnt</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Gerät nicht berühren oder anstoßen</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Kalibrierung läuft</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Berechnung läuft</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Abgeschlossen</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Gerät darf bewegt werden</translation>
    </message>
</context>
<context>
    <name>CalibrationReferenceCheckPopup</name>
    <message>
        <source>Measurement Starting</source>
        <translation>Messung beginnt</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>Messung läuft</translation>
    </message>
</context>
<context>
    <name>CalibrationSensorPopup</name>
    <message>
        <source>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</source>
        <translation>Nicht alle Drucksensoren sind aktiv. Drücken Sie OK, um die Kalibrierung zu starten, sobald alle Drucksensoren aktiv sind</translation>
    </message>
    <message>
        <source>Incorrect Position</source>
        <translation>Falsche Position</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>CalibrationStep2PageContents</name>
    <message>
        <source>PLACE ON A FLAT SURFACE</source>
        <translation>AUF EBENE FLÄCHE STELLEN</translation>
    </message>
    <message>
        <source>ALIGN WHITE LINE</source>
        <translation>WEISSE LINIE AUSRICHTEN</translation>
    </message>
</context>
<context>
    <name>CalibrationStep3PageContents</name>
    <message>
        <source>Tap the calibrate button to start calibration</source>
        <translation>Tippen Sie auf „Kalibrieren“, um die Kalibrierung zu starten</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Kalibrieren</translation>
    </message>
    <message>
        <source>or</source>
        <translation>oder</translation>
    </message>
    <message>
        <source>Press the measurement button on the instrument</source>
        <translation>Drücken Sie die Messtaste am Gerät</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPage</name>
    <message>
        <source>Step 1</source>
        <translation>Schritt 1</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>Schritt %1</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPageContainer</name>
    <message>
        <source>Tap the self test button to start self testing</source>
        <translation>Tippen Sie auf „Selbsttest“, um den Selbsttest zu starten</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Selbsttest</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>Kalibrieren Sie Ihr Gerät mit der mitgelieferten weißen Referenzkachel.</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>Seriennummer: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>Setzen Sie das Gerät auf die weiße Kalibrierkachel und richten Sie die weiße Linie an der Markierung aus.</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Überprüfen Sie Ihr Gerät mit der mitgelieferten Effekt-Referenzkachel. Seriennummer: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>Setzen Sie das Gerät auf die Effekt-Referenzkachel und richten Sie die weiße Linie an der Markierung aus</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>Führen Sie den Selbsttest mit der mitgelieferten weißen Referenzkachel durch. Seriennummer: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>Setzen Sie das Gerät auf die weiße Referenzkachel und richten Sie die weiße Linie an der Markierung aus</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Führen Sie den Selbsttest mit der mitgelieferten Effekt-Referenzkachel durch. Seriennummer: %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>Führen Sie den Selbsttest mit angehobenem Gerät durch (frei in der Luft, nirgends aufgesetzt)</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>Kalibrierung</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>Referenzkachel-Prüfung</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>Selbsttest %1: %2</translation>
    </message>
</context>
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>Referenzprüfung fehlgeschlagen</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Gerätespeicher voll</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>Der Speicher reicht für diesen Auftrag nicht aus. Bitte löschen Sie vorhandene Aufträge, um Speicher freizugeben.</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>Keine Datenbankeinträge</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>Messung abgebrochen</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>Das Gerät wurde während der Messung bewegt</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>Ungültiger Index</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>Kalibrierfehler</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>Gerät nicht auf der Weißkachel oder interner Weißstandard verschmutzt</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>Kalibrierdaten ungültig</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Nicht kalibriert</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>Externe Weißkachel zu verschmutzt oder falsche Weißkachel</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>Messung abgebrochen</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>Die Messung wurde vom Benutzer abgebrochen</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>Akku schwach. Bitte Akku laden</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>Akku leer. Das Gerät schaltet sich aus</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>Fehler im Verschlussmotor</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>Keine gespeicherte Referenzmessung</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>Spektrale Integrationszeit auf Weiß zu lang</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>Wellenlängenverschiebung über dem Grenzwert von 5 nm</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>Wenig Speicher frei</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Fehler beim Wechsel des WLAN-Modus</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Fehler bei der WLAN-Suche</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>Probentemperatur zu hoch (IR-Sensor)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>Probentemperatur zu niedrig (IR-Sensor)</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>Akkuladung für das Update zu gering</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>Datum und Uhrzeit nicht eingestellt</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>Fehler bei der Initialisierung. Bitte starten Sie das Gerät neu</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>Kommunikationsfehler der Hardware. Bitte starten Sie das Gerät neu</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>Fehler während der Messung</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>Unterschiedliche beste Übereinstimmungen der Prüfpunkte</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Kalibrierung läuft</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>Alle Proben löschen?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>No</source>
        <translation>Nein</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>Auftrag löschen</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>Auftrag ansehen/bearbeiten</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>Auftrag kopieren</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Auftrag an Server senden</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>Auftrag ausführen</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>Alle abgeschlossenen Aufträge löschen</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>Aufträge</translation>
    </message>
    <message>
        <source>+</source>
        <translation>+</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Offen</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Fertig</translation>
    </message>
    <message>
        <source>Open (%1)</source>
        <translation>Offen (%1)</translation>
    </message>
    <message>
        <source>Complete (%1)</source>
        <translation>Fertig (%1)</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>Auftrag löschen?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>Der gesamte Auftrag und alle Proben werden endgültig gelöscht.</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>Alle abgeschlossenen Aufträge löschen?</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>Alle abgeschlossenen Aufträge werden endgültig gelöscht.</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Gerätespeicher voll</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>Ein neuer Auftrag kann erst angelegt werden, wenn vorhandene Aufträge vom Gerät gelöscht wurden.</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>Der Speicher reicht für diesen Auftrag nicht aus. Bitte löschen Sie vorhandene Aufträge, um Speicher freizugeben.</translation>
    </message>
</context>
<context>
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>Gerät gesperrt</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>Messung läuft</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>Ruhig halten</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Gerät nicht berühren oder anstoßen</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Berechnung läuft</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Gerät darf bewegt werden</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>Ausschalten</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Neu starten</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>Ein Fehler ist aufgetreten. Bitte starten Sie das Gerät neu</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>SelfTestListItem</name>
    <message>
        <source>Pass</source>
        <translation>Bestanden</translation>
    </message>
    <message>
        <source>Fail</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>Canceled</source>
        <translation>Abgebrochen</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Störung</translation>
    </message>
</context>
<context>
    <name>SelfTestPopup</name>
    <message>
        <source>Hold the instrument in open air</source>
        <translation>Gerät frei in der Luft halten</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Gerät nicht berühren oder anstoßen</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Abgeschlossen</translation>
    </message>
</context>
<context>
    <name>SelfTestScreen</name>
    <message>
        <source>Self Test</source>
        <translation>Selbsttest</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>White Calibration</source>
        <translation>Weißkalibrierung</translation>
    </message>
    <message>
        <source>Reference check on white</source>
        <translation>Referenzprüfung auf Weiß</translation>
    </message>
    <message>
        <source>Effect tile test</source>
        <translation>Effektkachel-Test</translation>
    </message>
    <message>
        <source>Repeatability tests</source>
        <translation>Wiederholbarkeitstests</translation>
    </message>
    <message>
        <source>Temperature tests</source>
        <translation>Temperaturtests</translation>
    </message>
    <message>
        <source>Pressure sensor test</source>
        <translation>Drucksensortest</translation>
    </message>
    <message>
        <source>Check error logs</source>
        <translation>Fehlerprotokolle prüfen</translation>
    </message>
    <message>
        <source>Testing...</source>
        <translation>Test läuft...</translation>
    </message>
    <message>
        <source>All Tests Complete</source>
        <translation>Alle Tests abgeschlossen</translation>
    </message>
    <message>
        <source>Self Tests Canceled</source>
        <translation>Selbsttests abgebrochen</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>Englisch</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>Spanisch</translation>
    </message>
    <message>
        <source>French</source>
        <translation>Französisch</translation>
    </message>
    <message>
        <source>German</source>
        <translation>Deutsch</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>Italienisch</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>Portugiesisch</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>Japanisch</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>Koreanisch</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>Chinesisch (vereinfacht)</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Benutzerdefiniert</translation>
    </message>
    <message>
        <source>-45%1</source>
        <translation>-45%1</translation>
    </message>
    <message>
        <source>-15%1</source>
        <translation>-15%1</translation>
    </message>
    <message>
        <source>15%1</source>
        <translation>15%1</translation>
    </message>
    <message>
        <source>45%1</source>
        <translation>45%1</translation>
    </message>
    <message>
        <source>80%1</source>
        <translation>80%1</translation>
    </message>
    <message>
        <source>Diffuse</source>
        <translation>Diffus</translation>
    </message>
    <message>
        <source>25%1</source>
        <translation>25%1</translation>
    </message>
    <message>
        <source>75%1</source>
        <translation>75%1</translation>
    </message>
    <message>
        <source>110%1</source>
        <translation>110%1</translation>
    </message>
    <message>
        <source>A/2%1</source>
        <translation>A/2%1</translation>
    </message>
    <message>
        <source>A/10%1</source>
        <translation>A/10%1</translation>
    </message>
    <message>
        <source>C/2%1</source>
        <translation>C/2%1</translation>
    </message>
    <message>
        <source>C/10%1</source>
        <translation>C/10%1</translation>
    </message>
    <message>
        <source>D50/2%1</source>
        <translation>D50/2%1</translation>
    </message>
    <message>
        <source>D50/10%1</source>
        <translation>D50/10%1</translation>
    </message>
    <message>
        <source>D55/2%1</source>
        <translation>D55/2%1</translation>
    </message>
    <message>
        <source>D55/10%1</source>
        <translation>D55/10%1</translation>
    </message>
    <message>
        <source>D65/2%1</source>
        <translation>D65/2%1</translation>
    </message>
    <message>
        <source>D65/10%1</source>
        <translation>D65/10%1</translation>
    </message>
    <message>
        <source>D75/2%1</source>
        <translation>D75/2%1</translation>
    </message>
    <message>
        <source>D75/10%1</source>
        <translation>D75/10%1</translation>
    </message>
    <message>
        <source>F2/2%1</source>
        <translation>F2/2%1</translation>
    </message>
    <message>
        <source>F2/10%1</source>
        <translation>F2/10%1</translation>
    </message>
    <message>
        <source>F7/2%1</source>
        <translation>F7/2%1</translation>
    </message>
    <message>
        <source>F7/10%1</source>
        <translation>F7/10%1</translation>
    </message>
    <message>
        <source>F8/2%1</source>
        <translation>F8/2%1</translation>
    </message>
    <message>
        <source>F8/10%1</source>
        <translation>F8/10%1</translation>
    </message>
    <message>
        <source>F10/2%1</source>
        <translation>F10/2%1</translation>
    </message>
    <message>
        <source>F10/10%1</source>
        <translation>F10/10%1</translation>
    </message>
    <message>
        <source>F11/2%1</source>
        <translation>F11/2%1</translation>
    </message>
    <message>
        <source>F11/10%1</source>
        <translation>F11/10%1</translation>
    </message>
    <message>
        <source>F12/2%1</source>
        <translation>F12/2%1</translation>
    </message>
    <message>
        <source>F12/10%1</source>
        <translation>F12/10%1</translation>
    </message>
    <message>
        <source>Mid Tier</source>
        <translation>Mittelklasse</translation>
    </message>
    <message>
        <source>ALDER</source>
        <translation>ALDER</translation>
    </message>
    <message>
        <source>BIRCH</source>
        <translation>BIRCH</translation>
    </message>
    <message>
        <source>QC</source>
        <translation>QC</translation>
    </message>
    <message>
        <source>No Averaging</source>
        <translation>Keine Mittelung</translation>
    </message>
    <message>
        <source>Averaging 3</source>
        <translation>Mittelung 3</translation>
    </message>
    <message>
        <source>Averaging 5</source>
        <translation>Mittelung 5</translation>
    </message>
    <message>
        <source>SMC m:n</source>
        <translation>SMC m:n</translation>
    </message>
    <message>
        <source>White Tile</source>
        <translation>Weißstandard</translation>
    </message>
    <message>
        <source>Reference Tile</source>
        <translation>Referenzstandard</translation>
    </message>
    <message>
        <source>Lifted</source>
        <translation>Abgehoben</translation>
    </message>
    <message>
        <source>White Tile Complete</source>
        <translation>Weißstandard fertig</translation>
    </message>
    <message>
        <source>Reference Tile Complete</source>
        <translation>Referenzstandard fertig</translation>
    </message>
    <message>
        <source>Lifted Complete</source>
        <translation>Abheben fertig</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>Auftragsdaten werden synchronisiert</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>Mittelwert speichern</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>Auftrag neu starten</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>Rückgängig</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
</context>
<context>
    <name>WebSyncButton</name>
    <message>
        <source>Send All Jobs To Server</source>
        <translation>Alle Aufträge an Server senden</translation>
    </message>
</context>
</TS>
