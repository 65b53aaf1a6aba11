<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES">
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>Falló la comprobación de referencia</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Memoria del instrumento llena</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>No hay memoria suficiente para completar el trabajo. Elimine trabajos existentes para liberar memoria.</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>No hay entradas en la base de datos</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>Medición cancelada</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>El instrumento se movió durante la medición</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>Índice no válido</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>Error de calibración</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>El instrumento no está sobre la placa blanca o el blanco interno está sucio</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>Datos de calibración no válidos</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>No calibrado</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>Placa blanca externa demasiado sucia o incorrecta</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>Medición interrumpida</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>El usuario ha interrumpido la medición</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>Batería baja. Cargue la batería</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>Batería agotada. El instrumento se apagará</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>Error en el motor del obturador</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>No hay ninguna medición de referencia guardada</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>Tiempo de integración espectral sobre blanco demasiado largo</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>Desplazamiento de longitud de onda superior al límite de 5 nm</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>Poco espacio libre</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Problema al cambiar el modo Wi-Fi</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Problema al buscar redes Wi-Fi</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>Temperatura de la muestra demasiado alta (sensor IR)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>Temperatura de la muestra demasiado baja (sensor IR)</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>Nivel de batería demasiado bajo para actualizar</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>Fecha y hora sin configurar</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>Problema durante la inicialización. Reinicie el dispositivo</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>Error de comunicación del hardware. Reinicie el dispositivo</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>Error durante la medición</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>Diferentes mejores coincidencias para los puntos de control</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrando</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>¿Eliminar todas las muestras?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
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
        <translation>¿Eliminar muestra?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
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
        <translation>Imágenes de cámara</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>Eliminar trabajo</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>Ver/editar trabajo</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>Copiar trabajo</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Enviar trabajo al servidor</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>Ejecutar trabajo</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>Eliminar todos los trabajos completados</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>Trabajos</translation>
    </message>
    <message>
        <source>+</source>
        <translation>+</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Abiertos</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Completados</translation>
    </message>
    <message>
        <source>Open (%1)</source>
        <translation>Abiertos (%1)</translation>
    </message>
    <message>
        <source>Complete (%1)</source>
        <translation>Completados (%1)</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>¿Eliminar trabajo?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>El trabajo completo y todas sus muestras se eliminarán de forma permanente.</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>¿Eliminar todos los trabajos completados?</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>Todos los trabajos completados se eliminarán de forma permanente.</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Memoria del instrumento llena</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>No se puede crear un trabajo nuevo hasta que se eliminen uno o más trabajos del instrumento.</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>No hay memoria suficiente para completar el trabajo. Elimine trabajos existentes para liberar memoria.</translation>
    </message>
</context>
<context>
    <name>JobMeasureScreen</name>
    <message>
        <source>Summary</source>
        <translation>Resumen</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Medir</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Guardar</translation>
    </message>
    <message>
        <source>Job Details</source>
        <translation>Detalles del trabajo</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nombre:</translation>
    </message>
    <message>
        <source>%1:</source>
        <translation>%1:</translation>
    </message>
    <message>
        <source>Notes:</source>
        <translation>Notas:</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Enviar trabajo al servidor</translation>
    </message>
    <message>
        <source>SMC Results</source>
        <translation>Resultado SMC</translation>
    </message>
    <message>
        <source>Average Results</source>
        <translation>Resultado promedio</translation>
    </message>
    <message>
        <source>Measurements</source>
        <translation>Mediciones</translation>
    </message>
    <message>
        <source>%1 of %2 completed</source>
        <translation>%1/%2 completadas</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>¿Eliminar trabajo?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>El trabajo completo y todas sus muestras se eliminarán de forma permanente.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>This job was not created on the instrument. Are you sure you want to edit the job?</source>
        <translation>Este trabajo no se creó en el instrumento. ¿Seguro que desea editarlo?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Editar</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>Instrumento bloqueado</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>Midiendo</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>Mantenga firme</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>No toque ni golpee el instrumento</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Calculando</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Ya puede mover el instrumento</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>Apagar</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Reiniciar</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>Se ha producido un error. Reinicie el instrumento</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewer</name>
    <message>
        <source>Color View</source>
        <translation>Vista de color</translation>
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
        <translation>Textura 15%1</translation>
    </message>
</context>
<context>
    <name>SampleListSelectionItemComplete</name>
    <message>
        <source>More measurements are needed to complete this job</source>
        <translation>Se necesitan más mediciones para completar este trabajo</translation>
    </message>
</context>
<context>
    <name>SampleResultsPage</name>
    <message>
        <source>Measurement</source>
        <translation>Medición</translation>
    </message>
    <message>
        <source>Camera Images</source>
        <translation>Imágenes de cámara</translation>
    </message>
</context>
<context>
    <name>SampleViewScreen</name>
    <message>
        <source>Details</source>
        <translation>Detalles</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>Inglés</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>Español</translation>
    </message>
    <message>
        <source>French</source>
        <translation>Francés</translation>
    </message>
    <message>
        <source>German</source>
        <translation>Alemán</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>Italiano</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>Portugués</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>Japonés</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>Coreano</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>Chino simplificado</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Personalizado</translation>
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
        <translation>Difusa</translation>
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
        <translation>Gama media</translation>
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
        <translation>Sin promedio</translation>
    </message>
    <message>
        <source>Averaging 3</source>
        <translation>Promedio 3</translation>
    </message>
    <message>
        <source>Averaging 5</source>
        <translation>Promedio 5</translation>
    </message>
    <message>
        <source>SMC m:n</source>
        <translation>SMC m:n</translation>
    </message>
    <message>
        <source>White Tile</source>
        <translation>Patrón blanco</translation>
    </message>
    <message>
        <source>Reference Tile</source>
        <translation>Patrón de referencia</translation>
    </message>
    <message>
        <source>Lifted</source>
        <translation>Levantado</translation>
    </message>
    <message>
        <source>White Tile Complete</source>
        <translation>Patrón blanco completado</translation>
    </message>
    <message>
        <source>Reference Tile Complete</source>
        <translation>Patrón de referencia completado</translation>
    </message>
    <message>
        <source>Lifted Complete</source>
        <translation>Levantado completado</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>Sincronizando datos del trabajo</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>Guardar promedio</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>Reiniciar trabajo</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>Deshacer</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Atrás</translation>
    </message>
</context>
<context>
    <name>WebSyncButton</name>
    <message>
        <source>Send All Jobs To Server</source>
        <translation>Enviar todos los trabajos al servidor</translation>
    </message>
</context>
</TS>
