<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="it_IT">
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
        <translation>La misurazione è stata interrotta dall'utente</translation>
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
        <translation>Errore del motore dell'otturatore</translation>
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
        <translation>Spostamento di lunghezza d'onda oltre il limite assoluto di 5 nm</translation>
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
        <translation>Livello batteria troppo basso per l'aggiornamento</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>Data e ora non impostate</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>Problema durante l'inizializzazione. Riavviare il dispositivo</translation>
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
        <translation>L'intero lavoro e tutti i campioni verranno eliminati definitivamente.</translation>
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
        <translation>L'intero lavoro e tutti i campioni verranno eliminati definitivamente.</translation>
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
</TS>
