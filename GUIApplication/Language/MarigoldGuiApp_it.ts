<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="it_IT">
<context>
    <name>CalibrationNeededPopup</name>
    <message>
        <source>Calibration Required</source>
        <translation>Calibrazione necessaria</translation>
    </message>
    <message>
        <source>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</source>
        <translation>Non è possibile eseguire nuove misurazioni finché lo strumento non è calibrato. Premere Calibra per avviare la calibrazione.</translation>
    </message>
    <message>
        <source>Ignore</source>
        <translation>Ignora</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibra</translation>
    </message>
    <message>
        <source>Calibration needed within %1 %2</source>
        <translation>Calibrazione necessaria entro %1 %2</translation>
    </message>
    <message>
        <source>seconds</source>
        <translation>secondi</translation>
    </message>
    <message>
        <source>minutes</source>
        <translation>minuti</translation>
    </message>
    <message>
        <source>hours</source>
        <translation>ore</translation>
    </message>
    <message>
        <source>days</source>
        <translation>giorni</translation>
    </message>
</context>
<context>
    <name>CalibrationPopup</name>
    <message>
        <source>Calibration Starting</source>
        <translation>Avvio calibrazione</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrazione in corso</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Non toccare né urtare lo strumento</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Calcolo in corso</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Completato</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>È possibile spostare lo strumento</translation>
    </message>
</context>
<context>
    <name>CalibrationReferenceCheckPopup</name>
    <message>
        <source>Measurement Starting</source>
        <translation>Avvio misurazione</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>Misurazione</translation>
    </message>
</context>
<context>
    <name>CalibrationSensorPopup</name>
    <message>
        <source>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</source>
        <translation>Non tutti i sensori di pressione sono attivi. Premere OK per avviare la calibrazione quando tutti i sensori sono attivi</translation>
    </message>
    <message>
        <source>Incorrect Position</source>
        <translation>Posizione errata</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
</context>
<context>
    <name>CalibrationStep2PageContents</name>
    <message>
        <source>PLACE ON A FLAT SURFACE</source>
        <translation>APPOGGIARE SU SUPERFICIE PIANA</translation>
    </message>
    <message>
        <source>ALIGN WHITE LINE</source>
        <translation>ALLINEARE LA LINEA BIANCA</translation>
    </message>
</context>
<context>
    <name>CalibrationStep3PageContents</name>
    <message>
        <source>Tap the calibrate button to start calibration</source>
        <translation>Toccare il pulsante Calibra per avviare la calibrazione</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibra</translation>
    </message>
    <message>
        <source>or</source>
        <translation>oppure</translation>
    </message>
    <message>
        <source>Press the measurement button on the instrument</source>
        <translation>Premere il pulsante di misurazione sullo strumento</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPage</name>
    <message>
        <source>Step 1</source>
        <translation>Passo 1</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>Passo %1</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPageContainer</name>
    <message>
        <source>Tap the self test button to start self testing</source>
        <translation>Toccare il pulsante Autotest per avviare l&apos;autotest</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Autotest</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>Calibrare lo strumento con la piastrella bianca di riferimento in dotazione.</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>Numero di serie: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>Appoggiare lo strumento sulla piastrella bianca allineando la linea bianca al riferimento desiderato.</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Verificare lo strumento con la piastrella di riferimento a effetto in dotazione. Numero di serie: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>Appoggiare lo strumento sulla piastrella di riferimento a effetto allineando la linea bianca al riferimento desiderato</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>Eseguire l&apos;autotest dello strumento con la piastrella bianca di riferimento in dotazione. Numero di serie: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>Appoggiare lo strumento sulla piastrella bianca di riferimento allineando la linea bianca al riferimento desiderato</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Eseguire l&apos;autotest dello strumento con la piastrella di riferimento a effetto in dotazione. Numero di serie: %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>Eseguire l&apos;autotest sollevando lo strumento in aria (senza appoggiarlo su nulla)</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>Calibrazione</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>Autotest %1: %2</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>Verifica piastrella di riferimento</translation>
    </message>
</context>
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>Avviso</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>Verifica di riferimento non riuscita</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Memoria dello strumento piena</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>Memoria insufficiente per completare il lavoro. Eliminare lavori esistenti per liberare memoria.</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Errore</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>Nessuna voce nel database</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>Misurazione annullata</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>Lo strumento è stato spostato durante la misurazione</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>Indice non valido</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>Errore di calibrazione</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>Strumento non sulla piastrella bianca, o bianco interno sporco</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>Dati di calibrazione non validi</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Non calibrato</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>Piastrella bianca esterna troppo sporca o errata</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>Misurazione interrotta</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>La misurazione è stata interrotta dall&apos;utente</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>Batteria scarica. Ricaricare la batteria</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>Batteria esaurita. Lo strumento si spegnerà</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>Errore del motore dell&apos;otturatore</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>Nessuna misurazione di riferimento memorizzata</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>Tempo di integrazione spettrale sul bianco troppo lungo</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>Spostamento di lunghezza d&apos;onda oltre il limite assoluto di 5 nm</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>Spazio insufficiente</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Problema durante il cambio di modalità Wi-Fi</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Problema durante la ricerca Wi-Fi</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>Temperatura del campione troppo alta (sensore IR)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>Temperatura del campione troppo bassa (sensore IR)</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>Livello batteria troppo basso per l&apos;aggiornamento</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>Data e ora non impostate</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>Problema durante l&apos;inizializzazione. Riavviare il dispositivo</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>Errore di comunicazione hardware. Riavviare il dispositivo</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>Errore durante la misurazione</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>Corrispondenze migliori diverse per i punti di controllo</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrazione in corso</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>DeleteAllSamplesPopup</name>
    <message>
        <source>Clear Database</source>
        <translation>Cancella database</translation>
    </message>
    <message>
        <source>Are you sure you want to clear the database, this will delete all samples and jobs from the instrument?</source>
        <translation>Cancellare davvero il database? Tutti i campioni e i lavori dello strumento verranno eliminati.</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>Eliminare tutti i campioni?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Elimina</translation>
    </message>
    <message>
        <source>No</source>
        <translation>No</translation>
    </message>
</context>
<context>
    <name>DeleteSamplePopup</name>
    <message>
        <source>Delete Sample?</source>
        <translation>Eliminare il campione?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Elimina</translation>
    </message>
    <message>
        <source>No</source>
        <translation>No</translation>
    </message>
</context>
<context>
    <name>ImageViewScreen</name>
    <message>
        <source>Camera Images</source>
        <translation>Immagini fotocamera</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>Elimina lavoro</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>Visualizza/modifica lavoro</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>Copia lavoro</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Invia lavoro al server</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>Esegui lavoro</translation>
    </message>
</context>
<context>
    <name>JobFreeTextEditScreen</name>
    <message>
        <source>Notes</source>
        <translation>Note</translation>
    </message>
</context>
<context>
    <name>JobKeypadScreen</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>Special Keys</source>
        <translation>Simboli</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>Elimina tutti i lavori completati</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>Lavori</translation>
    </message>
    <message>
        <source>+</source>
        <translation>+</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Aperti</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Completati</translation>
    </message>
    <message>
        <source>Open (%1)</source>
        <translation>Aperti (%1)</translation>
    </message>
    <message>
        <source>Complete (%1)</source>
        <translation>Completati (%1)</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>Eliminare il lavoro?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>L&apos;intero lavoro e tutti i campioni verranno eliminati definitivamente.</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>Eliminare tutti i lavori completati?</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>Tutti i lavori completati verranno eliminati definitivamente.</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Memoria dello strumento piena</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>Non è possibile creare un nuovo lavoro finché non si eliminano uno o più lavori dallo strumento.</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>Memoria insufficiente per completare il lavoro. Eliminare lavori esistenti per liberare memoria.</translation>
    </message>
</context>
<context>
    <name>JobMeasureScreen</name>
    <message>
        <source>Summary</source>
        <translation>Riepilogo</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Elimina</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Misura</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Salva</translation>
    </message>
    <message>
        <source>Job Details</source>
        <translation>Dettagli del lavoro</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nome:</translation>
    </message>
    <message>
        <source>%1:</source>
        <translation>%1:</translation>
    </message>
    <message>
        <source>Notes:</source>
        <translation>Note:</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Invia lavoro al server</translation>
    </message>
    <message>
        <source>SMC Results</source>
        <translation>Risultato SMC</translation>
    </message>
    <message>
        <source>Average Results</source>
        <translation>Risultato medio</translation>
    </message>
    <message>
        <source>Measurements</source>
        <translation>Misurazioni</translation>
    </message>
    <message>
        <source>%1 of %2 completed</source>
        <translation>%1 di %2 completate</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>Eliminare il lavoro?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>L&apos;intero lavoro e tutti i campioni verranno eliminati definitivamente.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Avviso</translation>
    </message>
    <message>
        <source>This job was not created on the instrument. Are you sure you want to edit the job?</source>
        <translation>Questo lavoro non è stato creato sullo strumento. Modificarlo comunque?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Modifica</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
</context>
<context>
    <name>JobNameEditScreen</name>
    <message>
        <source>Name</source>
        <translation>Nome</translation>
    </message>
    <message>
        <source>Job Name cannot be empty</source>
        <translation>Il nome del lavoro non può essere vuoto</translation>
    </message>
    <message>
        <source>Enter a unique job name that is not empty</source>
        <translation>Inserire un nome di lavoro univoco e non vuoto</translation>
    </message>
    <message>
        <source>Job Name Already Exists</source>
        <translation>Nome del lavoro già esistente</translation>
    </message>
    <message>
        <source>This job name already exists.  Please change the name to a unique name</source>
        <translation>Questo nome di lavoro esiste già. Sceglierne uno univoco</translation>
    </message>
</context>
<context>
    <name>JobTagEditScreen</name>
    <message>
        <source>Tag Name Does Not Exist</source>
        <translation>Etichetta inesistente</translation>
    </message>
    <message>
        <source>This tag name does not exist. Please change the name to an existing tag name</source>
        <translation>Questa etichetta non esiste. Sceglierne una esistente</translation>
    </message>
</context>
<context>
    <name>Keypad</name>
    <message>
        <source>123</source>
        <translation>123</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
</context>
<context>
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>Strumento bloccato</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>Misurazione</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>Tenere fermo</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Non toccare né urtare lo strumento</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Calcolo in corso</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>È possibile spostare lo strumento</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>Spegni</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Riavvia</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
</context>
<context>
    <name>RestoreFactorySettingsPopup</name>
    <message>
        <source>Confirm by moving the dot around the circle</source>
        <translation>Conferma trascinando il punto lungo il cerchio</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Ripristina impostazioni di fabbrica</translation>
    </message>
    <message>
        <source>All current user settings will go back to defaults. Any jobs or samples will also be lost!</source>
        <translation>Tutte le impostazioni torneranno ai valori predefiniti. Anche i lavori e i campioni andranno persi!</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>Errore</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>Si è verificato un errore. Riavviare lo strumento</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewer</name>
    <message>
        <source>Color View</source>
        <translation>Vista colore</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD15</name>
    <message>
        <source>15%1 Series</source>
        <translation>Serie 15%1</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD45</name>
    <message>
        <source>45%1 Series</source>
        <translation>Serie 45%1</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerTexture</name>
    <message>
        <source>15%1 Texture</source>
        <translation>Texture 15%1</translation>
    </message>
</context>
<context>
    <name>SampleListSelectionItemComplete</name>
    <message>
        <source>More measurements are needed to complete this job</source>
        <translation>Servono altre misurazioni per completare questo lavoro</translation>
    </message>
</context>
<context>
    <name>SampleResultsPage</name>
    <message>
        <source>Measurement</source>
        <translation>Misurazione</translation>
    </message>
    <message>
        <source>Camera Images</source>
        <translation>Immagini fotocamera</translation>
    </message>
</context>
<context>
    <name>SampleViewScreen</name>
    <message>
        <source>Details</source>
        <translation>Dettagli</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Elimina</translation>
    </message>
</context>
<context>
    <name>SelfTestListItem</name>
    <message>
        <source>Pass</source>
        <translation>Superato</translation>
    </message>
    <message>
        <source>Fail</source>
        <translation>Non superato</translation>
    </message>
    <message>
        <source>Canceled</source>
        <translation>Annullato</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Errore</translation>
    </message>
</context>
<context>
    <name>SelfTestPopup</name>
    <message>
        <source>Hold the instrument in open air</source>
        <translation>Tenere lo strumento sollevato in aria</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Non toccare né urtare lo strumento</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Completato</translation>
    </message>
</context>
<context>
    <name>SelfTestScreen</name>
    <message>
        <source>Self Test</source>
        <translation>Autotest</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>White Calibration</source>
        <translation>Calibrazione del bianco</translation>
    </message>
    <message>
        <source>Reference check on white</source>
        <translation>Verifica di riferimento sul bianco</translation>
    </message>
    <message>
        <source>Effect tile test</source>
        <translation>Test piastrella a effetto</translation>
    </message>
    <message>
        <source>Repeatability tests</source>
        <translation>Test di ripetibilità</translation>
    </message>
    <message>
        <source>Temperature tests</source>
        <translation>Test di temperatura</translation>
    </message>
    <message>
        <source>Pressure sensor test</source>
        <translation>Test sensori di pressione</translation>
    </message>
    <message>
        <source>Check error logs</source>
        <translation>Controlla registri errori</translation>
    </message>
    <message>
        <source>Testing...</source>
        <translation>Test in corso...</translation>
    </message>
    <message>
        <source>All Tests Complete</source>
        <translation>Tutti i test completati</translation>
    </message>
    <message>
        <source>Self Tests Canceled</source>
        <translation>Autotest annullati</translation>
    </message>
</context>
<context>
    <name>SettingsDatabaseMemoryPage</name>
    <message>
        <source>Database / Memory</source>
        <translation>Database / memoria</translation>
    </message>
    <message>
        <source>Samples</source>
        <translation>Campioni</translation>
    </message>
    <message>
        <source>Jobs</source>
        <translation>Lavori</translation>
    </message>
    <message>
        <source>Clear Database</source>
        <translation>Cancella database</translation>
    </message>
</context>
<context>
    <name>SettingsDirectoryExplorerPage</name>
    <message>
        <source>No files</source>
        <translation>Nessun file</translation>
    </message>
</context>
<context>
    <name>SettingsDisplayPage</name>
    <message>
        <source>Display Settings</source>
        <translation>Display</translation>
    </message>
    <message>
        <source>Display Brightness</source>
        <translation>Luminosità display</translation>
    </message>
</context>
<context>
    <name>SettingsFileViewerPage</name>
    <message>
        <source>The file can&apos;t be shown.</source>
        <translation>Impossibile mostrare il file.</translation>
    </message>
    <message>
        <source>The file can&apos;t be read.</source>
        <translation>Impossibile leggere il file.</translation>
    </message>
</context>
<context>
    <name>SettingsLanguagePage</name>
    <message>
        <source>Language</source>
        <translation>Lingua</translation>
    </message>
</context>
<context>
    <name>SettingsLegalInformationPage</name>
    <message>
        <source>Legal Information</source>
        <translation>Informazioni legali</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionPowerInfo</name>
    <message>
        <source>%1 hour </source>
        <translation>%1 ora </translation>
    </message>
    <message>
        <source>%1 hours </source>
        <translation>%1 ore </translation>
    </message>
    <message>
        <source>%1 minutes and </source>
        <translation>%1 minuti e </translation>
    </message>
    <message>
        <source>%1 seconds</source>
        <translation>%1 secondi</translation>
    </message>
    <message>
        <source>Never</source>
        <translation>Mai</translation>
    </message>
    <message>
        <source>Display dims after: %1
Standby after: %2
Power off after: %3</source>
        <translation>Attenuazione dopo: %1
Standby dopo: %2
Spegnimento dopo: %3</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionProgressItem</name>
    <message>
        <source>%1%</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <translation>%1 di %2</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionSliderItem</name>
    <message>
        <source>Never</source>
        <translation>Mai</translation>
    </message>
</context>
<context>
    <name>SettingsMainPage</name>
    <message>
        <source>Settings</source>
        <translation>Impostazioni</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>Valida</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>Scaduta</translation>
    </message>
    <message>
        <source>Not Connected</source>
        <translation>Non connesso</translation>
    </message>
    <message>
        <source>%1</source>
        <translation>%1</translation>
    </message>
    <message>
        <source>%1%</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Power</source>
        <translation>Alimentazione</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Lingua</translation>
    </message>
    <message>
        <source>Calibration</source>
        <translation>Calibrazione</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Opzioni di misura</translation>
    </message>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>Display Settings</source>
        <translation>Display</translation>
    </message>
    <message>
        <source>Beeper Volume</source>
        <translation>Volume segnale acustico</translation>
    </message>
    <message>
        <source>Power Saving Options</source>
        <translation>Risparmio energetico</translation>
    </message>
    <message>
        <source>System &amp; Diagnostics</source>
        <translation>Sistema e diagnostica</translation>
    </message>
</context>
<context>
    <name>SettingsMeasurementPage</name>
    <message>
        <source>On</source>
        <translation>Attivo</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Disattivo</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Opzioni di misura</translation>
    </message>
    <message>
        <source>Auto Measurement</source>
        <translation>Misura automatica</translation>
    </message>
    <message>
        <source>Time to start auto measurement (sec):</source>
        <translation>Tempo prima della misura automatica (s):</translation>
    </message>
    <message>
        <source>Measurement Mode</source>
        <translation>Modalità di misura</translation>
    </message>
    <message>
        <source>No. of good measurements required:</source>
        <translation>N. di misure valide richieste:</translation>
    </message>
    <message>
        <source>Maximum measurements:</source>
        <translation>Numero massimo di misure:</translation>
    </message>
    <message>
        <source>Auto Measurements: %1</source>
        <translation>Misure automatiche: %1</translation>
    </message>
    <message>
        <source>Display LABCH: %1</source>
        <translation>Mostra LABCH: %1</translation>
    </message>
    <message>
        <source>Override Pressure Sensors: %1</source>
        <translation>Ignora sensori di pressione: %1</translation>
    </message>
</context>
<context>
    <name>SettingsPowerOptionsPage</name>
    <message>
        <source>Power Saving
Options</source>
        <translation>Risparmio
energetico</translation>
    </message>
    <message>
        <source>Dim Display</source>
        <translation>Attenua display</translation>
    </message>
    <message>
        <source>Standby Mode</source>
        <translation>Modalità standby</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Spegni</translation>
    </message>
    <message>
        <source>Seconds until display dims:</source>
        <translation>Secondi prima di attenuare:</translation>
    </message>
    <message>
        <source>Minutes until standby mode:</source>
        <translation>Minuti prima dello standby:</translation>
    </message>
    <message>
        <source>Minutes until power off:</source>
        <translation>Minuti prima dello spegnimento:</translation>
    </message>
</context>
<context>
    <name>SettingsPowerPage</name>
    <message>
        <source>Power</source>
        <translation>Alimentazione</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Spegni</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Riavvia</translation>
    </message>
    <message>
        <source>Shutdown Instrument?</source>
        <translation>Spegnere lo strumento?</translation>
    </message>
    <message>
        <source>Are you sure you want to shutdown the instrument?</source>
        <translation>Spegnere davvero lo strumento?</translation>
    </message>
    <message>
        <source>Enter Standby Mode?</source>
        <translation>Passare in standby?</translation>
    </message>
    <message>
        <source>Are you sure you want to put the instrument into standby mode?</source>
        <translation>Mettere davvero lo strumento in standby?</translation>
    </message>
    <message>
        <source>Reboot Instrument?</source>
        <translation>Riavviare lo strumento?</translation>
    </message>
    <message>
        <source>Are you sure you want to reboot the instrument?</source>
        <translation>Riavviare davvero lo strumento?</translation>
    </message>
    <message>
        <source>Yes</source>
        <translation>Sì</translation>
    </message>
    <message>
        <source>No</source>
        <translation>No</translation>
    </message>
</context>
<context>
    <name>SettingsSystemAndDiagnosticsPage</name>
    <message>
        <source>System &amp;
Diagnostics</source>
        <translation>Sistema e
diagnostica</translation>
    </message>
    <message>
        <source>System Information</source>
        <translation>Informazioni di sistema</translation>
    </message>
    <message>
        <source>Database / Memory</source>
        <translation>Database / memoria</translation>
    </message>
    <message>
        <source>Legal Information</source>
        <translation>Informazioni legali</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Autotest</translation>
    </message>
</context>
<context>
    <name>SettingsSystemInformationPage</name>
    <message>
        <source>System Information</source>
        <translation>Informazioni di sistema</translation>
    </message>
    <message>
        <source>Not Configured</source>
        <translation>Non configurato</translation>
    </message>
    <message>
        <source>Instrument Model:</source>
        <translation>Modello:</translation>
    </message>
    <message>
        <source>Instrument Serial:</source>
        <translation>Numero di serie:</translation>
    </message>
    <message>
        <source>Part Number:</source>
        <translation>Codice articolo:</translation>
    </message>
    <message>
        <source>White Reference Tile:</source>
        <translation>Piastrella bianca:</translation>
    </message>
    <message>
        <source>Certification Date:</source>
        <translation>Data di certificazione:</translation>
    </message>
    <message>
        <source>Firmware Revision:</source>
        <translation>Versione firmware:</translation>
    </message>
    <message>
        <source>Interface Revision:</source>
        <translation>Versione interfaccia:</translation>
    </message>
    <message>
        <source>Kernel:</source>
        <translation>Kernel:</translation>
    </message>
    <message>
        <source>Bootloader:</source>
        <translation>Bootloader:</translation>
    </message>
    <message>
        <source>Server URL:</source>
        <translation>URL del server:</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Ripristina impostazioni di fabbrica</translation>
    </message>
    <message>
        <source>Open Source</source>
        <translation>Open source</translation>
    </message>
    <message>
        <source>Burn in BIRCH JuniperX/Juniper</source>
        <translation>Burn in BIRCH JuniperX/Juniper</translation>
    </message>
    <message>
        <source>Burn in ALDER Larch</source>
        <translation>Burn in ALDER Larch</translation>
    </message>
    <message>
        <source>Burn in Spruce / Sequoia</source>
        <translation>Burn in Spruce / Sequoia</translation>
    </message>
</context>
<context>
    <name>SettingsVolumePage</name>
    <message>
        <source>Beeper Volume</source>
        <translation>Volume segnale acustico</translation>
    </message>
</context>
<context>
    <name>SettingsWifiPage</name>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>On</source>
        <translation>Attivo</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Disattivo</translation>
    </message>
    <message>
        <source>Static IP</source>
        <translation>IP statico</translation>
    </message>
    <message>
        <source>DHCP</source>
        <translation>DHCP</translation>
    </message>
    <message>
        <source>Known Networks</source>
        <translation>Reti note</translation>
    </message>
    <message>
        <source>Unknown Networks</source>
        <translation>Reti disponibili</translation>
    </message>
    <message>
        <source>Connection Issue</source>
        <translation>Problema di connessione</translation>
    </message>
    <message>
        <source>Incorrect password</source>
        <translation>Password errata</translation>
    </message>
    <message>
        <source>Network not in range</source>
        <translation>Rete fuori portata</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>Inglese</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>Spagnolo</translation>
    </message>
    <message>
        <source>French</source>
        <translation>Francese</translation>
    </message>
    <message>
        <source>German</source>
        <translation>Tedesco</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>Italiano</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>Portoghese</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>Giapponese</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>Coreano</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>Cinese semplificato</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Personalizzato</translation>
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
        <translation>Diffusa</translation>
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
        <translation>Fascia media</translation>
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
        <translation>Nessuna media</translation>
    </message>
    <message>
        <source>Averaging 3</source>
        <translation>Media 3</translation>
    </message>
    <message>
        <source>Averaging 5</source>
        <translation>Media 5</translation>
    </message>
    <message>
        <source>SMC m:n</source>
        <translation>SMC m:n</translation>
    </message>
    <message>
        <source>White Tile</source>
        <translation>Piastrella bianca</translation>
    </message>
    <message>
        <source>Reference Tile</source>
        <translation>Piastrella di riferimento</translation>
    </message>
    <message>
        <source>Lifted</source>
        <translation>Sollevato</translation>
    </message>
    <message>
        <source>White Tile Complete</source>
        <translation>Piastrella bianca completata</translation>
    </message>
    <message>
        <source>Reference Tile Complete</source>
        <translation>Piastrella di riferimento completata</translation>
    </message>
    <message>
        <source>Lifted Complete</source>
        <translation>Sollevato completato</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>Sincronizzazione dati lavori</translation>
    </message>
</context>
<context>
    <name>TargetingScreen</name>
    <message>
        <source>Job</source>
        <translation>Lavoro</translation>
    </message>
    <message>
        <source>Press button to measure.</source>
        <translation>Premere il pulsante per misurare.</translation>
    </message>
    <message>
        <source>Targeting</source>
        <translation>Puntamento</translation>
    </message>
    <message>
        <source>Averaged 0 of SMC 0:0</source>
        <translation>Mediate 0 di SMC 0:0</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Misura</translation>
    </message>
    <message>
        <source>Terminate</source>
        <translation>Termina</translation>
    </message>
    <message>
        <source>Online Mode</source>
        <translation>Modalità online</translation>
    </message>
    <message>
        <source>Averaged %1 of SMC %2:%3</source>
        <translation>Mediate %1 di SMC %2:%3</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Exit Online Mode?</source>
        <translation>Uscire dalla modalità online?</translation>
    </message>
    <message>
        <source>Exiting online mode will stop targeting and return to the job list.</source>
        <translation>L&apos;uscita dalla modalità online interrompe il puntamento e torna all&apos;elenco dei lavori.</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Esci</translation>
    </message>
    <message>
        <source>Stop Measuring?</source>
        <translation>Interrompere la misura?</translation>
    </message>
    <message>
        <source>All measured samples and this job will be permanently deleted.</source>
        <translation>Tutti i campioni misurati e questo lavoro verranno eliminati definitivamente.</translation>
    </message>
    <message>
        <source>All measured samples from this job will be permanently deleted.</source>
        <translation>Tutti i campioni misurati di questo lavoro verranno eliminati definitivamente.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Avviso</translation>
    </message>
    <message>
        <source>Continue</source>
        <translation>Continua</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue online mode until complete, or Exit online mode and return to the job list?</source>
        <translation>Temperatura fuori intervallo. Continuare in modalità online fino al termine o uscire e tornare all&apos;elenco dei lavori?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete job and all samples and return to the job list?</source>
        <translation>Temperatura fuori intervallo. Continuare il lavoro fino al termine o eliminare lavoro e campioni e tornare all&apos;elenco?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete all samples and return to the job list?</source>
        <translation>Temperatura fuori intervallo. Continuare il lavoro fino al termine o eliminare tutti i campioni e tornare all&apos;elenco?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Elimina</translation>
    </message>
    <message>
        <source>Override Pressure Sensors?</source>
        <translation>Ignorare i sensori di pressione?</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Press the measure button again to start a measurement, otherwise press the cancel button to return to targeting mode.</source>
        <translation>Non tutti i sensori di pressione sono attivi. Premere di nuovo il pulsante di misura per misurare, oppure Annulla per tornare al puntamento.</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Informazioni</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Please ensure all pressure sensors are active before measuring</source>
        <translation>Non tutti i sensori di pressione sono attivi. Assicurarsi che lo siano tutti prima di misurare</translation>
    </message>
    <message>
        <source>Continue Measuring?</source>
        <translation>Continuare a misurare?</translation>
    </message>
    <message>
        <source>To continue with measurements, press OK</source>
        <translation>Per continuare le misure, premere OK</translation>
    </message>
    <message>
        <source>Job Time Elapsed</source>
        <translation>Tempo del lavoro scaduto</translation>
    </message>
    <message>
        <source>The job wasn&apos;t completed within the allocated time</source>
        <translation>Il lavoro non è stato completato nel tempo previsto</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.</source>
        <translation>SMC terminato forzatamente, tutte le letture mediate per il risultato.</translation>
    </message>
    <message>
        <source>Maximum number of SMC measurements used for this job</source>
        <translation>Raggiunto il numero massimo di misure SMC per questo lavoro</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Completato</translation>
    </message>
    <message>
        <source>The job has completed.  Press OK to exit online mode</source>
        <translation>Il lavoro è completato. Premere OK per uscire dalla modalità online</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.  Press OK to exit online mode</source>
        <translation>SMC terminato forzatamente, tutte le letture mediate. Premere OK per uscire dalla modalità online</translation>
    </message>
    <message>
        <source>SMC failed after maximum measurements %1, the final results are averaged.  Press OK to exit online mode</source>
        <translation>SMC non riuscito dopo il massimo di %1 misure, il risultato finale è mediato. Premere OK per uscire dalla modalità online</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>Salva media</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>Riavvia lavoro</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Indietro</translation>
    </message>
</context>
<context>
    <name>WebSyncButton</name>
    <message>
        <source>Send All Jobs To Server</source>
        <translation>Invia tutti i lavori al server</translation>
    </message>
</context>
<context>
    <name>WifiPasswordScreen</name>
    <message>
        <source>Password</source>
        <translation>Password</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>@&amp;*</source>
        <translation>@&amp;*</translation>
    </message>
</context>
</TS>
