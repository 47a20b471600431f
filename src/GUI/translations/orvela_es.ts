<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es" sourcelanguage="en">
<context>
    <name>CBatchMode</name>
    <message>
        <source>Batch Mode</source>
        <translation>Modo por lotes</translation>
    </message>
    <message>
        <source>Batch mode is now off.</source>
        <translation>El modo por lotes está ahora desactivado.</translation>
    </message>
</context>
<context>
    <name>CColorPicker</name>
    <message>
        <source>Color</source>
        <translation>Color</translation>
    </message>
    <message>
        <source>Red</source>
        <translation>Rojo</translation>
    </message>
    <message>
        <source>Green</source>
        <translation>Verde</translation>
    </message>
    <message>
        <source>Blue</source>
        <translation>Azul</translation>
    </message>
</context>
<context>
    <name>CColorPickerPopup</name>
    <message>
        <source>Color field</source>
        <translation>Campo de color</translation>
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
        <translation>&lt;p&gt;&lt;b&gt;Orvela&lt;/b&gt; mide una fotografía y la corrige: luz, contraste, niveles, color, textura y ruido, por sí solo o con unos veinticinco controles.&lt;/p&gt;&lt;p&gt;&lt;b&gt;Colaboradores&lt;/b&gt;&lt;br&gt;Motor, ventanas, manual y gráficos: Kestrand&lt;br&gt;Ventanas y ajustes: Qt&lt;br&gt;Procesamiento paralelo: oneAPI Threading Building Blocks&lt;/p&gt;&lt;p&gt;Orvela es software libre bajo la Licencia Pública General de GNU, versión 3 o posterior. Se ofrece sin garantía alguna.&lt;/p&gt;</translation>
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
        <translation>Elija el preajuste que se aplicará</translation>
    </message>
    <message>
        <source>This list holds the predefined settings and those you saved.</source>
        <translation>Los preajustes incluidos y los que usted ha guardado.</translation>
    </message>
    <message>
        <source>Preset</source>
        <translation>Preajuste</translation>
    </message>
    <message>
        <source>View the Orvela Manual.</source>
        <translation>Abrir el manual de Orvela.</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Ayuda</translation>
    </message>
    <message>
        <source>Validates the current settings and process the picture.</source>
        <translation>Aceptar los ajustes y procesar la imagen.</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
    <message>
        <source>Go back to the mode selection without any processement.</source>
        <translation>Volver a la selección sin modificar la imagen.</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>CDlgCustomPresetImpl</name>
    <message>
        <source>There are no custom preset to load.</source>
        <translation>No hay ningún preajuste propio que cargar.</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Información</translation>
    </message>
    <message>
        <source>You don&apos;t have any profiles yet. You can create and save profiles in the Advanced mode window.</source>
        <translation>Todavía no tiene preajustes. Puede crearlos y guardarlos en la ventana «Avanzado».</translation>
    </message>
</context>
<context>
    <name>CDlgDualPreview</name>
    <message>
        <source>Orvela Preview</source>
        <translation>Vista previa de Orvela</translation>
    </message>
    <message>
        <source>This window holds a preview of your original picture and the processed picture.</source>
        <translation>Esta ventana muestra una vista previa de la imagen original y de la imagen procesada.</translation>
    </message>
</context>
<context>
    <name>CDlgMain</name>
    <message>
        <source>This is the Orvela&apos;s main window. Select a mode to begin the processing.</source>
        <translation>La ventana principal de Orvela. Elija un modo para empezar.</translation>
    </message>
    <message>
        <source>Collapse the window.</source>
        <translation>Contraer la ventana.</translation>
    </message>
    <message>
        <source>Expand the window.</source>
        <translation>Expandir la ventana.</translation>
    </message>
    <message>
        <source>Display the Orvela About dialog.</source>
        <translation>Acerca de Orvela.</translation>
    </message>
    <message>
        <source>A new update is available.</source>
        <translation>Hay una nueva versión disponible.</translation>
    </message>
    <message>
        <source>Auto</source>
        <translation>Automático</translation>
    </message>
    <message>
        <source>Use this mode to fine tune each filter, and achieve more complex processement.</source>
        <translation>Ajustar cada filtro por separado y combinar filtros.</translation>
    </message>
    <message>
        <source>Process a picture with previously saved settings in a snap.</source>
        <translation>Procesar una imagen con un preajuste guardado.</translation>
    </message>
    <message>
        <source>Click to toggle batch mode.</source>
        <translation>Activar o desactivar el modo por lotes.</translation>
    </message>
    <message>
        <source>View the Orvela Manual.</source>
        <translation>Abrir el manual de Orvela.</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automático</translation>
    </message>
    <message>
        <source>Auto Contrast</source>
        <translation>Autocontraste</translation>
    </message>
    <message>
        <source>Auto Levels</source>
        <translation>Autoniveles</translation>
    </message>
    <message>
        <source>Auto Color</source>
        <translation>Autocolor</translation>
    </message>
    <message>
        <source>Auto Saturation</source>
        <translation>Autosaturación</translation>
    </message>
    <message>
        <source>Adjustments</source>
        <translation>Ajustes</translation>
    </message>
    <message>
        <source>Add Illumination</source>
        <translation>Más luz</translation>
    </message>
    <message>
        <source>Advanced</source>
        <translation>Avanzado</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Propios</translation>
    </message>
    <message>
        <source>All Filters</source>
        <translation>Filtros</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Ayuda</translation>
    </message>
    <message>
        <source>About</source>
        <translation>Acerca de</translation>
    </message>
    <message>
        <source>Batch Mode is on</source>
        <translation>Por lotes: sí</translation>
    </message>
    <message>
        <source>Batch Mode is off</source>
        <translation>Por lotes: no</translation>
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
        <translation>Modo por lotes activado</translation>
    </message>
    <message>
        <source>Batch mode is now enabled! Next time when you start Orvela, Orvela will process the image with the last operation you performed with orvela.

To disable batch mode, hold &lt;b&gt;SHIFT&lt;/b&gt; pressed when selecting Orvela from Plug-ins menu.</source>
        <translation>El modo por lotes está activado. La próxima vez que inicie Orvela, procesará la imagen con la última operación que realizó.

Para desactivarlo, mantenga pulsada la tecla &lt;b&gt;Mayús&lt;/b&gt; al elegir Orvela en el menú de filtros.</translation>
    </message>
    <message>
        <source>Update Available</source>
        <translation>Nueva versión</translation>
    </message>
</context>
<context>
    <name>CDlgProgramInfos</name>
    <message>
        <source>Orvela Program Informations</source>
        <translation>Información de Orvela</translation>
    </message>
    <message>
        <source>&lt;h2&gt;Orvela %1&lt;/h2&gt;&lt;p&gt;A filter by Kestrand that enhances photographs.&lt;/p&gt;&lt;p&gt;It serves hosts with the Photoshop filter interface, version 4, and stands in their menu of filters under Kestrand.&lt;/p&gt;&lt;p&gt;It takes pictures with 8 or 16 bits per channel: grey, duotone, RGB, CMYK, Lab, HSL, HSB and multichannel.&lt;/p&gt;</source>
        <translation>&lt;h2&gt;Orvela %1&lt;/h2&gt;&lt;p&gt;Un filtro de Kestrand que mejora fotografías.&lt;/p&gt;&lt;p&gt;Funciona en programas con la interfaz de filtros de Photoshop, versión 4, y aparece en su menú de filtros bajo Kestrand.&lt;/p&gt;&lt;p&gt;Admite imágenes de 8 o 16 bits por canal: escala de grises, duotono, RGB, CMYK, Lab, HSL, HSB y multicanal.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;p&gt;Made with the Qt toolkit (LGPL, version 3) and oneAPI Threading Building Blocks (Apache License, version 2.0). Orvela itself is free software under the GNU General Public License, version 3 or later; it comes without any warranty.&lt;/p&gt;</source>
        <translation>&lt;p&gt;Hecho con Qt (LGPL, versión 3) y oneAPI Threading Building Blocks (Apache License, versión 2.0). Orvela es software libre bajo la Licencia Pública General de GNU, versión 3 o posterior; se ofrece sin garantía alguna.&lt;/p&gt;</translation>
    </message>
</context>
<context>
    <name>CDlgSettings</name>
    <message>
        <source>Auto-Refresh</source>
        <translation>Automático</translation>
    </message>
    <message>
        <source>Force refreshing the Previews.</source>
        <translation>Actualizar la vista previa.</translation>
    </message>
    <message>
        <source>Stop processing the picture.</source>
        <translation>Detener el procesamiento.</translation>
    </message>
    <message>
        <source>Zoom out from the preview pictures.</source>
        <translation>Alejar la vista previa.</translation>
    </message>
    <message>
        <source>Get closer to the previewed pictures.</source>
        <translation>Acercar la vista previa.</translation>
    </message>
    <message>
        <source>Turn on all sliders.</source>
        <translation>Activar todos los controles.</translation>
    </message>
    <message>
        <source>Turn off all sliders.</source>
        <translation>Desactivar todos los controles.</translation>
    </message>
    <message>
        <source>Split the Preview pictures onto 2 windows.</source>
        <translation>Separar la vista previa en 2 ventanas.</translation>
    </message>
    <message>
        <source>Glue the Preview windows to one single pane.</source>
        <translation>Unir las vistas previas en una sola ventana.</translation>
    </message>
    <message>
        <source>This list holds the predefined settings and those you saved.</source>
        <translation>Los preajustes incluidos y los que usted ha guardado.</translation>
    </message>
    <message>
        <source>Revert the settings to last time the Profile was saved.</source>
        <translation>Volver al preajuste tal como se guardó.</translation>
    </message>
    <message>
        <source>Save the current Profile. You will be prompted for a name.</source>
        <translation>Guardar como preajuste; se le pedirá un nombre.</translation>
    </message>
    <message>
        <source>Delete the current values to a preset.</source>
        <translation>Eliminar este preajuste.</translation>
    </message>
    <message>
        <source>Validates the current settings and process the picture.</source>
        <translation>Aceptar los ajustes y procesar la imagen.</translation>
    </message>
    <message>
        <source>Go back to the mode selection without any processement.</source>
        <translation>Volver a la selección sin modificar la imagen.</translation>
    </message>
    <message>
        <source>View the Orvela Manual.</source>
        <translation>Abrir el manual de Orvela.</translation>
    </message>
</context>
<context>
    <name>CDlgSettingsImpl</name>
    <message>
        <source>Applying custom advanced filter:</source>
        <translation>Aplicando el preajuste: </translation>
    </message>
    <message>
        <source>Save Preset</source>
        <translation>Guardar preajuste</translation>
    </message>
    <message>
        <source>Enter a name for the preset to be saved as.</source>
        <translation>Nombre con el que se guardará el preajuste:</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>The current preset cannot be deleted, since it&apos;s one of the factory presets.</source>
        <translation>Este preajuste forma parte de Orvela y no se puede eliminar.</translation>
    </message>
    <message>
        <source>Deleting Preset</source>
        <translation>Eliminar preajuste</translation>
    </message>
    <message>
        <source>Are you sure you want to delete the selected preset?</source>
        <translation>¿Seguro que desea eliminar el preajuste seleccionado?</translation>
    </message>
    <message>
        <source>By reverting the profile, you will
loose the changes you have made. Proceed?</source>
        <translation>Al restablecer el preajuste se perderán
los cambios realizados. ¿Continuar?</translation>
    </message>
    <message>
        <source>Calling applyNonIteractiveMode when mRunInNonInteractiveMode is false.</source>
        <translation>Se llamó a applyNonIteractiveMode con mRunInNonInteractiveMode en falso.</translation>
    </message>
    <message>
        <source>Stop Processing</source>
        <translation>Detener el procesamiento</translation>
    </message>
    <message>
        <source>The picture could not be processed: %1</source>
        <translation>No se pudo procesar la imagen: %1</translation>
    </message>
    <message>
        <source>A step of the processing failed and was left out: %1 (%2)</source>
        <translation>Falló un paso del procesamiento y se omitió: %1 (%2)</translation>
    </message>
    <message>
        <source>all sliders on</source>
        <translation>todos los controles activados</translation>
    </message>
    <message>
        <source>all sliders off</source>
        <translation>todos los controles desactivados</translation>
    </message>
    <message>
        <source>%1 on</source>
        <translation>%1 activado</translation>
    </message>
    <message>
        <source>%1 off</source>
        <translation>%1 desactivado</translation>
    </message>
    <message>
        <source>Color</source>
        <translation>Color</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Información</translation>
    </message>
    <message>
        <source>%1 was loaded without what this window has no slider for: %2</source>
        <translation>Se cargó %1 sin aquello para lo que esta ventana no tiene control: %2</translation>
    </message>
    <message>
        <source>preset %1</source>
        <translation>preajuste %1</translation>
    </message>
    <message>
        <source>reverting %1</source>
        <translation>restablecer %1</translation>
    </message>
    <message>
        <source>This name is kept for the last operation. Choose another one.</source>
        <translation>Este nombre está reservado para la última operación. Elija otro.</translation>
    </message>
    <message>
        <source>Use the picture nevertheless?</source>
        <translation>¿Usar la imagen de todos modos?</translation>
    </message>
</context>
<context>
    <name>CDlgSinglePreview</name>
    <message>
        <source>Orvela Preview</source>
        <translation>Vista previa de Orvela</translation>
    </message>
    <message>
        <source>This window holds a preview of your original picture and the processed picture.</source>
        <translation>Esta ventana muestra una vista previa de la imagen original y de la imagen procesada.</translation>
    </message>
</context>
<context>
    <name>COrvelaSliderBlock</name>
    <message>
        <source>Switches this setting on or off. So does a double click on its row.</source>
        <translation>Activa o desactiva este ajuste, igual que un doble clic en su fila.</translation>
    </message>
    <message>
        <source>Unamed</source>
        <translation>Sin nombre</translation>
    </message>
    <message>
        <source>This bar allows you to change this property value with your mouse only.</source>
        <translation>Este control permite cambiar el valor con el ratón.</translation>
    </message>
</context>
<context>
    <name>COrvelaSliderBlockImpl</name>
    <message>
        <source> shall be in range: </source>
        <translation> debe estar en el intervalo: </translation>
    </message>
    <message>
        <source> to </source>
        <translation> a </translation>
    </message>
</context>
<context>
    <name>COrvelaStatusIndicator</name>
    <message>
        <source>Progress</source>
        <translation>Progreso</translation>
    </message>
</context>
<context>
    <name>CPresetStore</name>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>Make sure that its folder has room and that you may write there. Your pictures are not affected.</source>
        <translation>Asegúrese de que haya espacio en la carpeta y de que pueda escribir en ella. Sus imágenes no se ven afectadas.</translation>
    </message>
    <message>
        <source>Note:</source>
        <translation>Nota:</translation>
    </message>
    <message>
        <source>Unknown preset:</source>
        <translation>Preajuste desconocido: </translation>
    </message>
    <message>
        <source>Unknown preset:%1</source>
        <translation>Preajuste desconocido: %1</translation>
    </message>
    <message>
        <source>This preset already exists. Do you want to overwrite it?</source>
        <translation>Este preajuste ya existe. ¿Desea sobrescribirlo?</translation>
    </message>
    <message>
        <source>A preset needs a name.</source>
        <translation>Un preajuste necesita un nombre.</translation>
    </message>
</context>
<context>
    <name>CSignaledGraphicsView</name>
    <message>
        <source>Preview</source>
        <translation>Vista previa</translation>
    </message>
</context>
<context>
    <name>CWgtPane3SlidersImpl</name>
    <message>
        <source>Note:</source>
        <translation>Nota:</translation>
    </message>
    <message>
        <source>invalid mode in CWgtPane3SlidersImpl::setSliders</source>
        <translation>modo no válido en CWgtPane3SlidersImpl::setSliders</translation>
    </message>
    <message>
        <source>invalid mode in CWgtPane3SlidersImpl::applyGUIParams</source>
        <translation>modo no válido en CWgtPane3SlidersImpl::applyGUIParams</translation>
    </message>
</context>
<context>
    <name>CWgtPaneAdvanced</name>
    <message>
        <source>Final Touch</source>
        <translation>Retoque final</translation>
    </message>
    <message>
        <source>Show the extended settings</source>
        <translation>Mostrar más ajustes</translation>
    </message>
    <message>
        <source>Hide the extended settings</source>
        <translation>Ocultar los ajustes adicionales</translation>
    </message>
    <message>
        <source> Extended Settings</source>
        <translation> Más ajustes</translation>
    </message>
    <message>
        <source>Lighting Functions</source>
        <translation>Luz</translation>
    </message>
    <message>
        <source>Perceptual / Absolute</source>
        <translation>Adaptado / Absoluto</translation>
    </message>
    <message>
        <source>Perceptual</source>
        <translation>Adaptado</translation>
    </message>
    <message>
        <source>Absolute</source>
        <translation>Absoluto</translation>
    </message>
    <message>
        <source>Color Functions</source>
        <translation>Color</translation>
    </message>
    <message>
        <source>Color Filter</source>
        <translation>Filtro de color</translation>
    </message>
    <message>
        <source>Artifacts Reduction</source>
        <translation>Defectos</translation>
    </message>
    <message>
        <source>Texture</source>
        <translation>Textura</translation>
    </message>
    <message>
        <source>Global</source>
        <translation>Global</translation>
    </message>
</context>
<context>
    <name>CWgtPaneFinalTouch</name>
    <message>
        <source>Final Touch</source>
        <translation>Retoque final</translation>
    </message>
    <message>
        <source>Perceptual</source>
        <translation>Adaptado</translation>
    </message>
    <message>
        <source>Levels</source>
        <translation>Niveles</translation>
    </message>
    <message>
        <source>Channel</source>
        <translation>Canal</translation>
    </message>
    <message>
        <source>Red</source>
        <translation>Rojo</translation>
    </message>
    <message>
        <source>Green</source>
        <translation>Verde</translation>
    </message>
    <message>
        <source>Blue</source>
        <translation>Azul</translation>
    </message>
    <message>
        <source>All channels</source>
        <translation>Todos los canales</translation>
    </message>
    <message>
        <source>Light and Color</source>
        <translation>Luz y color</translation>
    </message>
    <message>
        <source>Color Filter</source>
        <translation>Filtro de color</translation>
    </message>
    <message>
        <source>Absolute</source>
        <translation>Absoluto</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Atrás</translation>
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
        <translation>Hay una versión más reciente de Orvela. Usted tiene la versión %1; la última versión disponible es: %2.</translation>
    </message>
    <message>
        <source>An update to your version is available. You have version %1, latest available version is: %2.</source>
        <translation>Hay una actualización para su versión. Usted tiene la versión %1; la última versión disponible es: %2.</translation>
    </message>
</context>
<context>
    <name>Failure</name>
    <message>
        <source>The User Settings object was invalid.</source>
        <translation>Los ajustes de este paso no son válidos.</translation>
    </message>
    <message>
        <source>The filter has an invalid Output plane.</source>
        <translation>El filtro no tiene un plano de salida válido.</translation>
    </message>
    <message>
        <source>This version of GetRGBFromHost requires direct proxy.</source>
        <translation>La imagen original no está disponible para este paso.</translation>
    </message>
    <message>
        <source>unknown error</source>
        <translation>error desconocido</translation>
    </message>
    <message>
        <source>there is not enough memory; close other programs or take a smaller picture</source>
        <translation>no hay suficiente memoria; cierre otros programas o use una imagen más pequeña</translation>
    </message>
    <message>
        <source>The analyzer has an invalid Input plane.</source>
        <translation>El análisis no tiene un plano de entrada válido.</translation>
    </message>
    <message>
        <source>Only planes of the same size can exchange their samples.</source>
        <translation>Solo los planos del mismo tamaño pueden intercambiar sus valores.</translation>
    </message>
    <message>
        <source>The original picture is not at hand.</source>
        <translation>La imagen original no está disponible.</translation>
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
        <translation>Automático</translation>
    </message>
    <message>
        <source>AutomaticPro</source>
        <translation>Automático Pro</translation>
    </message>
    <message>
        <source>Auto Contrast</source>
        <translation>Autocontraste</translation>
    </message>
    <message>
        <source>Auto Levels</source>
        <translation>Autoniveles</translation>
    </message>
    <message>
        <source>Auto Color</source>
        <translation>Autocolor</translation>
    </message>
    <message>
        <source>Auto Saturation</source>
        <translation>Autosaturación</translation>
    </message>
    <message>
        <source>Portrait</source>
        <translation>Retrato</translation>
    </message>
    <message>
        <source>PortraitPro</source>
        <translation>Retrato Pro</translation>
    </message>
    <message>
        <source>Macro</source>
        <translation>Macro</translation>
    </message>
    <message>
        <source>MacroPro</source>
        <translation>Macro Pro</translation>
    </message>
    <message>
        <source>Landscape</source>
        <translation>Paisaje</translation>
    </message>
    <message>
        <source>LandscapePro</source>
        <translation>Paisaje Pro</translation>
    </message>
    <message>
        <source>Advanced</source>
        <translation>Avanzado</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Preajuste propio</translation>
    </message>
    <message>
        <source>Batch</source>
        <translation>Lote</translation>
    </message>
    <message>
        <source>Final Touch</source>
        <translation>Retoque final</translation>
    </message>
    <message>
        <source>Smart Sharpness</source>
        <translation>Nitidez</translation>
    </message>
    <message>
        <source>Smart Blur</source>
        <translation>Desenfoque</translation>
    </message>
    <message>
        <source>Add Illumination</source>
        <translation>Más luz</translation>
    </message>
    <message>
        <source>Add Digital Flash</source>
        <translation>Flash digital</translation>
    </message>
    <message>
        <source>Saturation</source>
        <translation>Saturación</translation>
    </message>
    <message>
        <source>Smart Contrast</source>
        <translation>Contraste</translation>
    </message>
    <message>
        <source>Smart Brightness</source>
        <translation>Brillo</translation>
    </message>
    <message>
        <source>Smart Gamma</source>
        <translation>Gamma</translation>
    </message>
    <message>
        <source>B&amp;W Spots Removal</source>
        <translation>Eliminar motas B/N</translation>
    </message>
    <message>
        <source>Noise Reduction</source>
        <translation>Reducir ruido</translation>
    </message>
    <message>
        <source>Moire Reduction</source>
        <translation>Reducir muaré</translation>
    </message>
    <message>
        <source>Temperature</source>
        <translation>Temperatura</translation>
    </message>
    <message>
        <source>Color Filter</source>
        <translation>Filtro de color</translation>
    </message>
    <message>
        <source>Smart Levels</source>
        <translation>Niveles</translation>
    </message>
    <message>
        <source>Adjustments</source>
        <translation>Ajustes</translation>
    </message>
</context>
<context>
    <name>PipelineTable</name>
    <message>
        <source>Measuring detail</source>
        <translation>Midiendo el detalle</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>Midiendo</translation>
    </message>
    <message>
        <source>Automatic gamma, first pass</source>
        <translation>Gamma automático, primera pasada</translation>
    </message>
    <message>
        <source>Illumination, first pass</source>
        <translation>Iluminación, primera pasada</translation>
    </message>
    <message>
        <source>Illumination, second pass</source>
        <translation>Iluminación, segunda pasada</translation>
    </message>
    <message>
        <source>Contrast, first pass</source>
        <translation>Contraste, primera pasada</translation>
    </message>
    <message>
        <source>Brightness limit</source>
        <translation>Límite de brillo</translation>
    </message>
    <message>
        <source>Smart blur</source>
        <translation>Desenfoque</translation>
    </message>
    <message>
        <source>Automatic colour</source>
        <translation>Color automático</translation>
    </message>
    <message>
        <source>Clarity</source>
        <translation>Claridad</translation>
    </message>
    <message>
        <source>Contrast, second pass</source>
        <translation>Contraste, segunda pasada</translation>
    </message>
    <message>
        <source>Saturation</source>
        <translation>Saturación</translation>
    </message>
    <message>
        <source>Noise</source>
        <translation>Ruido</translation>
    </message>
    <message>
        <source>Black and white spots</source>
        <translation>Motas blancas y negras</translation>
    </message>
    <message>
        <source>Gamma</source>
        <translation>Gamma</translation>
    </message>
    <message>
        <source>Contrast</source>
        <translation>Contraste</translation>
    </message>
    <message>
        <source>Moire</source>
        <translation>Muaré</translation>
    </message>
    <message>
        <source>Temperature</source>
        <translation>Temperatura</translation>
    </message>
    <message>
        <source>Colour filter</source>
        <translation>Filtro de color</translation>
    </message>
    <message>
        <source>Dark level</source>
        <translation>Sombras</translation>
    </message>
    <message>
        <source>Middle level</source>
        <translation>Medios tonos</translation>
    </message>
    <message>
        <source>Light level</source>
        <translation>Luces</translation>
    </message>
    <message>
        <source>Brightness and contrast</source>
        <translation>Brillo y contraste</translation>
    </message>
    <message>
        <source>Contrast, third pass</source>
        <translation>Contraste, tercera pasada</translation>
    </message>
    <message>
        <source>Measuring levels</source>
        <translation>Midiendo los niveles</translation>
    </message>
    <message>
        <source>Smart gamma</source>
        <translation>Gamma adaptado</translation>
    </message>
    <message>
        <source>Smart dark level</source>
        <translation>Sombras adaptadas</translation>
    </message>
    <message>
        <source>Smart middle level</source>
        <translation>Medios tonos adaptados</translation>
    </message>
    <message>
        <source>Smart light level</source>
        <translation>Luces adaptadas</translation>
    </message>
    <message>
        <source>Contrast, fourth pass</source>
        <translation>Contraste, cuarta pasada</translation>
    </message>
    <message>
        <source>Automatic gamma, second pass</source>
        <translation>Gamma automático, segunda pasada</translation>
    </message>
    <message>
        <source>Copying the picture</source>
        <translation>Copiando la imagen</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>Terminado</translation>
    </message>
    <message>
        <source>Failed</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>Final touch</source>
        <translation>Retoque final</translation>
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

Si el problema persiste, revise el registro del complemento y póngase en contacto
con el equipo de soporte de Kestrand.</translation>
    </message>
    <message>
        <source>Error while running Kestrand Orvela</source>
        <translation>Error al ejecutar Kestrand Orvela</translation>
    </message>
    <message>
        <source>The plug-in failed to run for an unknown reason.
If the problem persists, review the plug-in&apos;s log, and contact
the Kestrand support team.</source>
        <translation>El complemento no se pudo ejecutar por un motivo desconocido.
Si el problema persiste, revise el registro del complemento y póngase en contacto
con el equipo de soporte de Kestrand.</translation>
    </message>
    <message>
        <source>The was unable to create the About dialog.</source>
        <translation>No se pudo abrir la ventana de información del programa.</translation>
    </message>
    <message>
        <source>The plug-in was unable to prepare it&apos;s globals.</source>
        <translation>El complemento no pudo preparar sus datos.</translation>
    </message>
    <message>
        <source>The plug-in was unable to run it&apos;s main processing method.</source>
        <translation>El complemento no pudo ejecutar su procesamiento.</translation>
    </message>
</context>
<context>
    <name>PresetDrop</name>
    <message>
        <source>%1: is not a file; drop one preset file, such as one that --save-preset wrote</source>
        <translation>%1: no es un archivo; suelte un archivo de preajuste, como uno de --save-preset</translation>
    </message>
    <message>
        <source>%1: cannot be read: %2</source>
        <translation>%1: no se puede leer: %2</translation>
    </message>
    <message>
        <source>%1: is larger than 4 MB; drop a file that --save-preset wrote</source>
        <translation>%1: ocupa más de 4 MB; suelte un archivo de --save-preset</translation>
    </message>
    <message>
        <source>Only one preset file at a time can be dropped here, such as one that --save-preset wrote.</source>
        <translation>Aquí solo se puede soltar un archivo de preajuste a la vez, como uno de --save-preset.</translation>
    </message>
    <message>
        <source>%1: holds nothing that these sliders can show (%2); drop it on the window of Advanced</source>
        <translation>%1: no contiene nada que estos controles puedan mostrar (%2); suéltelo en la ventana «Avanzado»</translation>
    </message>
</context>
<context>
    <name>PresetFile</name>
    <message>
        <source>%1: %2 must be true or false</source>
        <translation>%1: %2 debe ser true o false</translation>
    </message>
    <message>
        <source>%1: %2 must be a number from 0 to %3</source>
        <translation>%1: %2 debe ser un número de 0 a %3</translation>
    </message>
    <message>
        <source>%1: is not JSON (%2 at byte %3); name a file that --save-preset wrote</source>
        <translation>%1: no es JSON (%2 en el byte %3); use un archivo de --save-preset</translation>
    </message>
    <message>
        <source>%1: is not a preset (a number &quot;version&quot; and an object &quot;settings&quot; are needed); name a file that --save-preset wrote</source>
        <translation>%1: no es un preajuste (se necesitan un número &quot;version&quot; y un objeto &quot;settings&quot;); use un archivo de --save-preset</translation>
    </message>
    <message>
        <source>%1: has version %2, this program reads version %3; use the program that wrote it</source>
        <translation>%1: tiene la versión %2 y este programa lee la versión %3; use el programa que lo escribió</translation>
    </message>
</context>
<context>
    <name>SettingsEdit</name>
    <message>
        <source>The settings could not be written to %1.</source>
        <translation>No se pudieron guardar los ajustes en %1.</translation>
    </message>
    <message>
        <source>The settings file %1 holds something else, and no copy of it could be made.</source>
        <translation>El archivo de ajustes %1 contiene otra cosa y no se pudo hacer una copia de él.</translation>
    </message>
</context>
<context>
    <name>SliderTable</name>
    <message>
        <source>Temperature</source>
        <translation>Temperatura</translation>
    </message>
    <message>
        <source>Makes the light warmer towards 2000 and cooler towards 10000, at the same brightness.</source>
        <translation>Hace la luz más cálida hacia 2000 y más fría hacia 10000, con el mismo brillo.</translation>
    </message>
    <message>
        <source>Gamma</source>
        <translation>Gamma</translation>
    </message>
    <message>
        <source>Lightens the midtones above 1 and darkens them below; 1 changes nothing.</source>
        <translation>Aclara los medios tonos por encima de 1 y los oscurece por debajo; 1 no cambia nada.</translation>
    </message>
    <message>
        <source>Noise</source>
        <translation>Ruido</translation>
    </message>
    <message>
        <source>Smooths noise and keeps edges: least at 0.5, most at 5. In large pictures its number counts even while it is off, if Sharpness is on.</source>
        <translation>Suaviza el ruido y conserva los bordes: lo mínimo con 0.5, lo máximo con 5. En imágenes grandes su número cuenta también cuando está desactivado, si la nitidez está activada.</translation>
    </message>
    <message>
        <source>AutoContrast</source>
        <translation>Autocontraste</translation>
    </message>
    <message>
        <source>Stretches the tones over the whole range; only on and off count.</source>
        <translation>Extiende los tonos por toda la gama; solo cuenta activado o desactivado.</translation>
    </message>
    <message>
        <source>Contrast</source>
        <translation>Contraste</translation>
    </message>
    <message>
        <source>Sets light and dark further apart above 0 and closer together below, whatever the picture.</source>
        <translation>Separa luces y sombras por encima de 0 y las acerca por debajo, sea cual sea la imagen.</translation>
    </message>
    <message>
        <source>Sets light and dark further apart, as far as the picture bears it: not at all at 0, most at 100.</source>
        <translation>Separa luces y sombras hasta donde la imagen lo admite: nada con 0, lo máximo con 100.</translation>
    </message>
    <message>
        <source>Brightness</source>
        <translation>Brillo</translation>
    </message>
    <message>
        <source>Makes everything lighter above 0 and darker below, whatever the picture.</source>
        <translation>Aclara todo por encima de 0 y lo oscurece por debajo, sea cual sea la imagen.</translation>
    </message>
    <message>
        <source>Makes the picture lighter above 0 and darker below, as far as it bears it.</source>
        <translation>Aclara la imagen por encima de 0 y la oscurece por debajo, hasta donde lo admite.</translation>
    </message>
    <message>
        <source>Illumination</source>
        <translation>Iluminación</translation>
    </message>
    <message>
        <source>Adds light, least to the brightest tones: hardly any at 0, most at 10.</source>
        <translation>Añade luz, menos a los tonos más claros: apenas con 0, lo máximo con 10.</translation>
    </message>
    <message>
        <source>Digital Flash</source>
        <translation>Flash digital</translation>
    </message>
    <message>
        <source>Lights the picture as a flash would have: not at all at 0, most at 100.</source>
        <translation>Ilumina la imagen como un flash: nada con 0, lo máximo con 100.</translation>
    </message>
    <message>
        <source>Saturation</source>
        <translation>Saturación</translation>
    </message>
    <message>
        <source>Makes colours paler below 5, grey at 0, and livelier above, most at 10.</source>
        <translation>Apaga los colores por debajo de 5, hasta el gris con 0, y los aviva por encima, lo máximo con 10.</translation>
    </message>
    <message>
        <source>B&amp;W Spots</source>
        <translation>Motas B/N</translation>
    </message>
    <message>
        <source>Takes isolated bright spots away when on; at every number as many.</source>
        <translation>Elimina motas claras aisladas si está activado; las mismas con cualquier número.</translation>
    </message>
    <message>
        <source>Sharpness I</source>
        <translation>Nitidez I</translation>
    </message>
    <message>
        <source>Brings out texture: 30 lightens the picture as well, 71 brings out most and keeps its brightness. Its number counts even while only Sharpness II is on.</source>
        <translation>Resalta la textura: 30 también aclara la imagen, 71 resalta al máximo y conserva el brillo. Su número cuenta también cuando solo está activada Nitidez II.</translation>
    </message>
    <message>
        <source>Sharpness II</source>
        <translation>Nitidez II</translation>
    </message>
    <message>
        <source>Brings out texture once more: 30 lightens the picture as well, 71 brings out most and keeps its brightness. Its number counts even while only Sharpness I is on.</source>
        <translation>Resalta la textura una vez más: 30 también aclara la imagen, 71 resalta al máximo y conserva el brillo. Su número cuenta también cuando solo está activada Nitidez I.</translation>
    </message>
    <message>
        <source>Smart Blur</source>
        <translation>Desenfoque</translation>
    </message>
    <message>
        <source>Smooths even areas and keeps edges: least at 0, most at 1.</source>
        <translation>Suaviza las zonas uniformes y conserva los bordes: lo mínimo con 0, lo máximo con 1.</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>Sombras</translation>
    </message>
    <message>
        <source>Darkens the midtones, and less the shadows and the lightest tones, as far as the picture bears it: not at all at 0, most at 255.</source>
        <translation>Oscurece los medios tonos, y menos las sombras y los tonos más claros, hasta donde la imagen lo admite: nada con 0, lo máximo con 255.</translation>
    </message>
    <message>
        <source>Middle</source>
        <translation>Medios tonos</translation>
    </message>
    <message>
        <source>Lightens the midtones above 1 and darkens them below, as far as the picture bears it.</source>
        <translation>Aclara los medios tonos por encima de 1 y los oscurece por debajo, hasta donde la imagen lo admite.</translation>
    </message>
    <message>
        <source>Highlights</source>
        <translation>Luces</translation>
    </message>
    <message>
        <source>Brightens the highlights, as far as the picture bears it: not at all at 255, most at 0.</source>
        <translation>Aclara las luces hasta donde la imagen lo admite: nada con 255, lo máximo con 0.</translation>
    </message>
    <message>
        <source>Darkens the midtones, and less the shadows and the lightest tones, whatever the picture: not at all at 0, most at 255.</source>
        <translation>Oscurece los medios tonos, y menos las sombras y los tonos más claros, sea cual sea la imagen: nada con 0, lo máximo con 255.</translation>
    </message>
    <message>
        <source>Above 1 multiplies all tones, whatever the picture, until light ones are white; below 1 changes hardly anything.</source>
        <translation>Multiplica todos los tonos por encima de 1, sea cual sea la imagen, hasta que los claros quedan blancos; por debajo de 1 apenas cambia nada.</translation>
    </message>
    <message>
        <source>Brightens the highlights, whatever the picture: least just below 255, most at 0, and 255 itself does as 0.</source>
        <translation>Aclara las luces, sea cual sea la imagen: lo mínimo justo por debajo de 255, lo máximo con 0, y el propio 255 actúa como 0.</translation>
    </message>
    <message>
        <source>Lightens the whole picture above 1 and darkens it below, as far as it bears it.</source>
        <translation>Aclara toda la imagen por encima de 1 y la oscurece por debajo, hasta donde lo admite.</translation>
    </message>
    <message>
        <source>Moire</source>
        <translation>Muaré</translation>
    </message>
    <message>
        <source>Puts the original back where processing made false patterns: in fewest places at 0.1, in most at 10.</source>
        <translation>Restaura el original donde el procesamiento creó patrones falsos: en menos lugares con 0.1, en más con 10.</translation>
    </message>
    <message>
        <source>AutoColor</source>
        <translation>Autocolor</translation>
    </message>
    <message>
        <source>Removes colour casts by stretching each colour, from 56 on; up to 55 it leaves colours alone.</source>
        <translation>Elimina dominantes de color extendiendo cada color, a partir de 56; hasta 55 no toca los colores.</translation>
    </message>
    <message>
        <source>Fade</source>
        <translation>Atenuar</translation>
    </message>
    <message>
        <source>Color Filter</source>
        <translation>Filtro de color</translation>
    </message>
    <message>
        <source>Tints the picture with the picked colour: not at all at 0, completely at 100.</source>
        <translation>Tiñe la imagen con el color elegido: nada con 0, por completo con 100.</translation>
    </message>
    <message>
        <source>Shadows</source>
        <translation>Sombras</translation>
    </message>
    <message>
        <source>Darkens the midtones of red, and less its shadows and lightest tones, as far as the picture bears it: not at all at 0, most at 255.</source>
        <translation>Oscurece los medios tonos del canal rojo, y menos sus sombras y tonos más claros, hasta donde la imagen lo admite: nada con 0, lo máximo con 255.</translation>
    </message>
    <message>
        <source>Darkens the midtones of green, and less its shadows and lightest tones, as far as the picture bears it: not at all at 0, most at 255.</source>
        <translation>Oscurece los medios tonos del canal verde, y menos sus sombras y tonos más claros, hasta donde la imagen lo admite: nada con 0, lo máximo con 255.</translation>
    </message>
    <message>
        <source>Darkens the midtones of blue, and less its shadows and lightest tones, as far as the picture bears it: not at all at 0, most at 255.</source>
        <translation>Oscurece los medios tonos del canal azul, y menos sus sombras y tonos más claros, hasta donde la imagen lo admite: nada con 0, lo máximo con 255.</translation>
    </message>
    <message>
        <source>Darkens the midtones of all colours, and less their shadows and lightest tones, as far as the picture bears it: not at all at 0, most at 255.</source>
        <translation>Oscurece los medios tonos de todos los canales, y menos sus sombras y tonos más claros, hasta donde la imagen lo admite: nada con 0, lo máximo con 255.</translation>
    </message>
    <message>
        <source>Lightens the midtones of red above 1 and darkens them below, as far as the picture bears it.</source>
        <translation>Aclara los medios tonos del canal rojo por encima de 1 y los oscurece por debajo, hasta donde la imagen lo admite.</translation>
    </message>
    <message>
        <source>Lightens the midtones of green above 1 and darkens them below, as far as the picture bears it.</source>
        <translation>Aclara los medios tonos del canal verde por encima de 1 y los oscurece por debajo, hasta donde la imagen lo admite.</translation>
    </message>
    <message>
        <source>Lightens the midtones of blue above 1 and darkens them below, as far as the picture bears it.</source>
        <translation>Aclara los medios tonos del canal azul por encima de 1 y los oscurece por debajo, hasta donde la imagen lo admite.</translation>
    </message>
    <message>
        <source>Lightens the midtones of all colours above 1 and darkens them below, as far as the picture bears it.</source>
        <translation>Aclara los medios tonos de todos los canales por encima de 1 y los oscurece por debajo, hasta donde la imagen lo admite.</translation>
    </message>
    <message>
        <source>Brightens the highlights of red, as far as the picture bears it: not at all at 255, most at 0.</source>
        <translation>Aclara las luces del canal rojo hasta donde la imagen lo admite: nada con 255, lo máximo con 0.</translation>
    </message>
    <message>
        <source>Brightens the highlights of green, as far as the picture bears it: not at all at 255, most at 0.</source>
        <translation>Aclara las luces del canal verde hasta donde la imagen lo admite: nada con 255, lo máximo con 0.</translation>
    </message>
    <message>
        <source>Brightens the highlights of blue, as far as the picture bears it: not at all at 255, most at 0.</source>
        <translation>Aclara las luces del canal azul hasta donde la imagen lo admite: nada con 255, lo máximo con 0.</translation>
    </message>
    <message>
        <source>Brightens the highlights of all colours, as far as the picture bears it: not at all at 255, most at 0.</source>
        <translation>Aclara las luces de todos los canales hasta donde la imagen lo admite: nada con 255, lo máximo con 0.</translation>
    </message>
    <message>
        <source>Darkens the midtones of red, and less its shadows and lightest tones, whatever the picture: not at all at 0, most at 255.</source>
        <translation>Oscurece los medios tonos del canal rojo, y menos sus sombras y tonos más claros, sea cual sea la imagen: nada con 0, lo máximo con 255.</translation>
    </message>
    <message>
        <source>Darkens the midtones of green, and less its shadows and lightest tones, whatever the picture: not at all at 0, most at 255.</source>
        <translation>Oscurece los medios tonos del canal verde, y menos sus sombras y tonos más claros, sea cual sea la imagen: nada con 0, lo máximo con 255.</translation>
    </message>
    <message>
        <source>Darkens the midtones of blue, and less its shadows and lightest tones, whatever the picture: not at all at 0, most at 255.</source>
        <translation>Oscurece los medios tonos del canal azul, y menos sus sombras y tonos más claros, sea cual sea la imagen: nada con 0, lo máximo con 255.</translation>
    </message>
    <message>
        <source>Darkens the midtones of all colours, and less their shadows and lightest tones, whatever the picture: not at all at 0, most at 255.</source>
        <translation>Oscurece los medios tonos de todos los canales, y menos sus sombras y tonos más claros, sea cual sea la imagen: nada con 0, lo máximo con 255.</translation>
    </message>
    <message>
        <source>Brightens the highlights of red, whatever the picture: not at all at 255, most at 0.</source>
        <translation>Aclara las luces del canal rojo, sea cual sea la imagen: nada con 255, lo máximo con 0.</translation>
    </message>
    <message>
        <source>Brightens the highlights of green, whatever the picture: not at all at 255, most at 0.</source>
        <translation>Aclara las luces del canal verde, sea cual sea la imagen: nada con 255, lo máximo con 0.</translation>
    </message>
    <message>
        <source>Brightens the highlights of blue, whatever the picture: not at all at 255, most at 0.</source>
        <translation>Aclara las luces del canal azul, sea cual sea la imagen: nada con 255, lo máximo con 0.</translation>
    </message>
    <message>
        <source>Brightens the highlights of all colours, whatever the picture: not at all at 255, most at 0.</source>
        <translation>Aclara las luces de todos los canales, sea cual sea la imagen: nada con 255, lo máximo con 0.</translation>
    </message>
    <message>
        <source>The colour with which Color Filter tints the picture.</source>
        <translation>El color con el que el filtro de color tiñe la imagen.</translation>
    </message>
    <message>
        <source>The colour with which Color Filter tints the finished picture.</source>
        <translation>El color con el que el filtro de color tiñe la imagen terminada.</translation>
    </message>
    <message>
        <source>Brings the original back where sharpness or digital flash is on: none of it at 0, most at 100. Its number counts even while it is off.</source>
        <translation>Recupera el original donde la nitidez o el flash digital están activados: nada con 0, lo máximo con 100. Su número cuenta también cuando está desactivado.</translation>
    </message>
    <message>
        <source>Multiplies the tones of red: lighter above 1, darker below, white included.</source>
        <translation>Multiplica los tonos del canal rojo: más claros por encima de 1, más oscuros por debajo, también el blanco.</translation>
    </message>
    <message>
        <source>Multiplies the tones of green: lighter above 1, darker below, white included.</source>
        <translation>Multiplica los tonos del canal verde: más claros por encima de 1, más oscuros por debajo, también el blanco.</translation>
    </message>
    <message>
        <source>Multiplies the tones of blue: lighter above 1, darker below, white included.</source>
        <translation>Multiplica los tonos del canal azul: más claros por encima de 1, más oscuros por debajo, también el blanco.</translation>
    </message>
    <message>
        <source>Multiplies the tones of all colours: lighter above 1, darker below, white included.</source>
        <translation>Multiplica los tonos de todos los canales: más claros por encima de 1, más oscuros por debajo, también el blanco.</translation>
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
        <translation>Manual de Orvela</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Atrás</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Adelante</translation>
    </message>
    <message>
        <source>First page</source>
        <translation>Primera página</translation>
    </message>
    <message>
        <source>Find on this page</source>
        <translation>Buscar en esta página</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Contenido</translation>
    </message>
    <message>
        <source>Not on this page</source>
        <translation>No está en esta página</translation>
    </message>
    <message>
        <source>Find on this page; the next place: %1 or %2, the one before: %3</source>
        <translation>Buscar en esta página; siguiente: %1 o %2; anterior: %3</translation>
    </message>
</context>
<context>
    <name>orvela::HistogramView</name>
    <message>
        <source>Histogram</source>
        <translation>Histograma</translation>
    </message>
    <message>
        <source>How often each brightness and colour occurs, from black to white. The line is the original picture.</source>
        <translation>Con qué frecuencia aparece cada brillo y color, del negro al blanco. La línea es la imagen original.</translation>
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
        <translation>Deshacer</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Rehacer</translation>
    </message>
</context>
<context>
    <name>orvela::PreviewBar</name>
    <message>
        <source>Fit</source>
        <translation>Encajar</translation>
    </message>
    <message>
        <source>1:1</source>
        <translation>1:1</translation>
    </message>
    <message>
        <source>Compare</source>
        <translation>Comparar</translation>
    </message>
    <message>
        <source>Draft</source>
        <translation>Borrador</translation>
    </message>
    <message>
        <source>A quick look while a slider moves. The exact picture follows.</source>
        <translation>Un vistazo rápido mientras se mueve un control. La imagen exacta viene después.</translation>
    </message>
    <message>
        <source>Show the whole width of the picture.</source>
        <translation>Mostrar todo el ancho de la imagen.</translation>
    </message>
    <message>
        <source>Show every pixel of the picture as one of the screen.</source>
        <translation>Mostrar cada píxel de la imagen como un píxel de la pantalla.</translation>
    </message>
    <message>
        <source>Draw a line across the processed picture, left of which the original is seen; %1 and %2 move it. Hold the space bar over the pictures, or %3, to see the whole original.</source>
        <translation>Dividir la imagen procesada con una línea a cuya izquierda se ve el original; %1 y %2 la mueven. Mantenga pulsada la barra espaciadora sobre las imágenes, o %3, para ver el original completo.</translation>
    </message>
</context>
<context>
    <name>orvela::Previews</name>
    <message>
        <source>Original picture</source>
        <translation>Imagen original</translation>
    </message>
    <message>
        <source>Processed picture</source>
        <translation>Imagen procesada</translation>
    </message>
    <message>
        <source>Original and Processed Pictures (Preview)</source>
        <translation>Imagen original y procesada (vista previa)</translation>
    </message>
    <message>
        <source>Original Picture (Preview)</source>
        <translation>Imagen original (vista previa)</translation>
    </message>
    <message>
        <source>Processed Picture (Preview)</source>
        <translation>Imagen procesada (vista previa)</translation>
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
        <translation>No volver a mostrar este mensaje</translation>
    </message>
    <message>
        <source>Ok</source>
        <translation>Aceptar</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>Mensaje</translation>
    </message>
</context>
</TS>
